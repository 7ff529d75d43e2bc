// Per-thread state. Every thread that parses or builds attaches first (OEAttachThread with its
// thread id) and detaches before it ends. Attachment creates the thread's record in the
// process-wide thread list; the record carries the thread's error code (1 = out of memory) and
// owns its parse log.
#ifndef OESDK_FOUNDATION_OETHREAD_H
#define OESDK_FOUNDATION_OETHREAD_H

#include "oeexport.h"
#include "foundation/oeparsewarning.h"

// Creates the record of the given thread (the id a host gets from GetCurrentThreadId() on
// Windows or gettid() on Linux; OEPlatform::CurrentThreadId() returns the same number).
// Returns 1 when the thread is attached (also when it already was), 0 when memory is short.
OE_API unsigned short OEAttachThread(unsigned long threadId);
// Destroys the thread's record and its log. Returns 0 when no thread was ever attached, else 1.
OE_API unsigned short OEDetachThread(unsigned long threadId);

// Error code values of a thread record.
enum OEThreadError { OETE_NONE = 0, OETE_OUTOFMEMORY = 1 };

// One record of the thread list.
class OE_API OEThreadRecord {
public:
    explicit OEThreadRecord(unsigned long threadId);
    ~OEThreadRecord();
    OEThreadRecord(const OEThreadRecord&) = delete;
    OEThreadRecord& operator=(const OEThreadRecord&) = delete;

    unsigned long m_threadId;
    unsigned long m_errorCode;     // OEThreadError; allocation failures set 1
    OEParseWarningLog* m_parseLog; // owned
};

namespace OEThreadState {

// The calling thread's record, or null when it never attached.
OE_API OEThreadRecord* Current();
// The record of a thread id, or null.
OE_API OEThreadRecord* Find(unsigned long threadId);

// The calling thread's error code; a thread that never attached reads 1 (out of memory), so
// every build on it fails.
OE_API unsigned long GetErrorCode();
// Sets the calling thread's error code; does nothing for a thread that never attached.
OE_API void SetErrorCode(unsigned long code);

// The calling thread's parse log (null when not attached or none installed).
OE_API OEParseWarningLog* GetParseLog();
// Installs a log for the calling thread and hands the previous one back to the caller, who then
// owns it. The record owns the new log. Returns null (and keeps `log` with the caller) when the
// thread is not attached: check with Current() first.
OE_API OEParseWarningLog* SetParseLog(OEParseWarningLog* log);

// Number of attached threads.
OE_API unsigned short NumberOfThreads();

} // namespace OEThreadState

#endif
