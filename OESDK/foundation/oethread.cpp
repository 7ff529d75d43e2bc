#include "foundation/oethread.h"

#include "foundation/oedynarr.h"
#include "foundation/oememory.h"
#include "parse/oeparselogger.h"
#include "platform/oeplatform.h"

#include <mutex>

// The list itself is guarded by a mutex: hosts attach and detach from their thread start and
// end notifications while other threads look up their own records.
namespace {

typedef OEPtrArray<OEThreadRecord> OEThreadList;

OEThreadList* g_threads = nullptr;

std::recursive_mutex& ListMutex() {
    static std::recursive_mutex m;
    return m;
}

OEThreadRecord* FindLocked(unsigned long threadId) {
    if (!g_threads) return nullptr;
    for (unsigned short i = 0; i < g_threads->Entries(); ++i) {
        OEThreadRecord* r = g_threads->Get(i);
        if (r && r->m_threadId == threadId) return r;
    }
    return nullptr;
}

} // namespace

OEParseWarningLog::~OEParseWarningLog() {}

OEThreadRecord::OEThreadRecord(unsigned long threadId)
    : m_threadId(threadId), m_errorCode(OETE_NONE), m_parseLog(nullptr) {}

OEThreadRecord::~OEThreadRecord() {
    delete m_parseLog;
}

unsigned short OEAttachThread(unsigned long threadId) {
    std::lock_guard<std::recursive_mutex> lock(ListMutex());
    if (!g_threads) {
        g_threads = OEMemory::New<OEThreadList>(5, 5);
        if (!g_threads) return 0;
    }
    if (FindLocked(threadId)) return 1;
    OEThreadRecord* record = OEMemory::New<OEThreadRecord>(threadId);
    if (!record) return 0;
    // The record owns the thread's parse log from the start.
    record->m_parseLog = OEMemory::New<OEParseLogger>();
    if (!record->m_parseLog) {
        delete record;
        return 0;
    }
    if (!g_threads->Append(record)) {
        delete record;
        return 0;
    }
    return 1;
}

unsigned short OEDetachThread(unsigned long threadId) {
    std::lock_guard<std::recursive_mutex> lock(ListMutex());
    if (!g_threads) return 0;
    for (unsigned short i = 0; i < g_threads->Entries(); ++i) {
        if (g_threads->Get(i)->m_threadId == threadId) {
            g_threads->Delete(i);
            break;
        }
    }
    return 1;
}

namespace OEThreadState {

OEThreadRecord* Find(unsigned long threadId) {
    std::lock_guard<std::recursive_mutex> lock(ListMutex());
    return FindLocked(threadId);
}

OEThreadRecord* Current() {
    return Find(OEPlatform::CurrentThreadId());
}

unsigned long GetErrorCode() {
    OEThreadRecord* r = Current();
    return r ? r->m_errorCode : static_cast<unsigned long>(OETE_OUTOFMEMORY);
}

void SetErrorCode(unsigned long code) {
    if (OEThreadRecord* r = Current()) r->m_errorCode = code;
}

OEParseWarningLog* GetParseLog() {
    OEThreadRecord* r = Current();
    return r ? r->m_parseLog : nullptr;
}

OEParseWarningLog* SetParseLog(OEParseWarningLog* log) {
    OEThreadRecord* r = Current();
    if (!r) return nullptr;
    OEParseWarningLog* old = r->m_parseLog;
    r->m_parseLog = log;
    return old;
}

unsigned short NumberOfThreads() {
    std::lock_guard<std::recursive_mutex> lock(ListMutex());
    return g_threads ? g_threads->Entries() : 0;
}

} // namespace OEThreadState

unsigned short OELogParseWarning(OEParseWarning code, const char* text, const char* auxText, OETagID tag,
                                 OEDataObj* object) {
    OEParseWarningLog* log = OEThreadState::GetParseLog();
    return log ? log->AppendWarning(code, text, auxText, tag, object) : 0;
}
