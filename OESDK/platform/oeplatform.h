// The platform layer: everything OESDK needs from the operating system and the host's utility
// library, behind one small interface with one implementation per OS (oeplatform_posix.cpp,
// oeplatform_win.cpp). Nothing else in the library calls the OS directly.
#ifndef OESDK_PLATFORM_OEPLATFORM_H
#define OESDK_PLATFORM_OEPLATFORM_H

#include "oeexport.h"

#include <cstdio>
#include <ctime>

namespace OEPlatform {

// The calling thread's id as a host passes it to OEAttachThread: GetCurrentThreadId() on
// Windows, the kernel thread id (gettid) on Linux.
OE_API unsigned long CurrentThreadId();

// Suspends the calling thread for at least the given number of milliseconds.
OE_API void Sleep(unsigned long milliseconds);

// One round of the wait loop's message pump. On Windows it drains the calling thread's window
// message queue (PeekMessageA / TranslateMessage / DispatchMessageA) and re-posts a WM_QUIT it
// met; elsewhere it calls the host's pump hook, if one is installed. Returns 1 when a quit
// request was seen, else 0.
typedef int (*PumpHook)(void* context);
OE_API int PumpMessages();
// Installs a host pump hook (POSIX; on Windows it runs after the window-message pump).
// Returns the previous hook. A null hook removes it.
OE_API PumpHook SetPumpHook(PumpHook hook, void* context);

// The C runtime's 64-bit time functions.
typedef long long OETime64;
OE_API OETime64 Time64(OETime64* out);
// Broken-down UTC time of a 64-bit time; returns 0 when the time cannot be represented.
OE_API int GmTime64(OETime64 t, std::tm* out);
// Local-time conversion as the C runtime's _mktime64 does (uses the machine's time zone);
// returns -1 when the fields cannot be represented.
OE_API OETime64 MkTime64(std::tm* fields);
// Broken-down local time of a 64-bit time; returns 0 when the time cannot be represented.
OE_API int LocalTime64(OETime64 t, std::tm* out);

} // namespace OEPlatform

// File wrappers of the host's utility library. Names are UTF-8 (converted to UTF-16 on Windows).
struct OEFileStat {
    long long size;         // bytes
    long long modifiedTime; // seconds since 1970-01-01 UTC
    unsigned int isDirectory;
};
OE_API std::FILE* _LDfopen(const char* name, const char* mode);
OE_API int _LDunlink(const char* name);
// 0 on success (and *out filled), -1 when the file cannot be examined.
OE_API int _LD_stat(const char* name, OEFileStat* out);

namespace Util {

// The host's message log: two severity numbers, the source module name, the line, the function
// name and the message text. The default writes one line to stderr.
typedef void (*MessageFunctor)(int severity, int subSeverity, const char* source, int line,
                               const char* function, const char* text);

class OE_API Ops {
public:
    Ops();
    MessageFunctor GetMessageFunctor() const;
    // Installs the host's functor; null restores the default. Returns the previous one.
    MessageFunctor SetMessageFunctor(MessageFunctor functor);
    // Formats (printf style) and hands one message to the functor.
    void Message(int severity, int subSeverity, const char* source, int line, const char* function,
                 const char* format, ...)
#if defined(__GNUC__)
        __attribute__((format(printf, 7, 8)))
#endif
        ;

private:
    MessageFunctor m_functor;
};

OE_API Ops& GetOps();
OE_API void DefaultMessageFunctor(int severity, int subSeverity, const char* source, int line,
                                  const char* function, const char* text);

} // namespace Util

#endif
