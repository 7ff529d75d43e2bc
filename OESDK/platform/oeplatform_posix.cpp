// POSIX implementation of the platform layer.
#include "platform/oeplatform.h"
#include "platform/internal/oepumphook.h"

#include <cerrno>
#include <ctime>
#include <sys/stat.h>
#include <sys/syscall.h>
#include <unistd.h>

namespace OEPlatform {

unsigned long CurrentThreadId() {
#if defined(SYS_gettid)
    return static_cast<unsigned long>(static_cast<unsigned int>(syscall(SYS_gettid)));
#else
    return static_cast<unsigned long>(reinterpret_cast<unsigned long long>(pthread_self()) & 0xFFFFFFFFu);
#endif
}

void Sleep(unsigned long milliseconds) {
    timespec ts;
    ts.tv_sec = static_cast<time_t>(milliseconds / 1000);
    ts.tv_nsec = static_cast<long>(milliseconds % 1000) * 1000000L;
    while (nanosleep(&ts, &ts) != 0 && errno == EINTR) {
    }
}

int PumpMessages() {
    return RunPumpHook();
}

OETime64 Time64(OETime64* out) {
    OETime64 t = static_cast<OETime64>(std::time(nullptr));
    if (out) *out = t;
    return t;
}

int GmTime64(OETime64 t, std::tm* out) {
    time_t tt = static_cast<time_t>(t);
    return out && gmtime_r(&tt, out) ? 1 : 0;
}

int LocalTime64(OETime64 t, std::tm* out) {
    time_t tt = static_cast<time_t>(t);
    return out && localtime_r(&tt, out) ? 1 : 0;
}

OETime64 MkTime64(std::tm* fields) {
    if (!fields) return -1;
    return static_cast<OETime64>(mktime(fields));
}

} // namespace OEPlatform

std::FILE* _LDfopen(const char* name, const char* mode) {
    if (!name || !mode) return nullptr;
    return std::fopen(name, mode);
}

int _LDunlink(const char* name) {
    return name ? unlink(name) : -1;
}

int _LD_stat(const char* name, OEFileStat* out) {
    struct stat st;
    if (!name || !out || stat(name, &st) != 0) return -1;
    out->size = static_cast<long long>(st.st_size);
    out->modifiedTime = static_cast<long long>(st.st_mtime);
    out->isDirectory = S_ISDIR(st.st_mode) ? 1u : 0u;
    return 0;
}
