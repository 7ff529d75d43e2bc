// Windows implementation of the platform layer.
#include "platform/oeplatform.h"
#include "platform/internal/oepumphook.h"

#include <windows.h>

#include <string>
#include <sys/stat.h>
#include <time.h>
#include <wchar.h>

namespace OEPlatform {

namespace {
std::wstring Widen(const char* utf8) {
    int n = MultiByteToWideChar(CP_UTF8, 0, utf8, -1, nullptr, 0);
    if (n <= 0) return std::wstring();
    std::wstring w(static_cast<size_t>(n), L'\0');
    MultiByteToWideChar(CP_UTF8, 0, utf8, -1, &w[0], n);
    w.resize(static_cast<size_t>(n - 1));
    return w;
}
} // namespace

unsigned long CurrentThreadId() {
    return static_cast<unsigned long>(GetCurrentThreadId());
}

void Sleep(unsigned long milliseconds) {
    ::Sleep(static_cast<DWORD>(milliseconds));
}

int PumpMessages() {
    int quit = 0;
    MSG msg;
    while (PeekMessageA(&msg, nullptr, 0, 0, PM_REMOVE)) {
        if (msg.message == WM_QUIT) {
            // Leave the quit request for the host's own loop.
            PostQuitMessage(static_cast<int>(msg.wParam));
            quit = 1;
            break;
        }
        TranslateMessage(&msg);
        DispatchMessageA(&msg);
    }
    if (RunPumpHook()) quit = 1;
    return quit;
}

OETime64 Time64(OETime64* out) {
    __time64_t t = _time64(nullptr);
    if (out) *out = static_cast<OETime64>(t);
    return static_cast<OETime64>(t);
}

int GmTime64(OETime64 t, std::tm* out) {
    __time64_t tt = static_cast<__time64_t>(t);
    return out && _gmtime64_s(out, &tt) == 0 ? 1 : 0;
}

int LocalTime64(OETime64 t, std::tm* out) {
    __time64_t tt = static_cast<__time64_t>(t);
    return out && _localtime64_s(out, &tt) == 0 ? 1 : 0;
}

OETime64 MkTime64(std::tm* fields) {
    if (!fields) return -1;
    return static_cast<OETime64>(_mktime64(fields));
}

} // namespace OEPlatform

std::FILE* _LDfopen(const char* name, const char* mode) {
    if (!name || !mode) return nullptr;
    return _wfopen(OEPlatform::Widen(name).c_str(), OEPlatform::Widen(mode).c_str());
}

int _LDunlink(const char* name) {
    return name ? _wunlink(OEPlatform::Widen(name).c_str()) : -1;
}

int _LD_stat(const char* name, OEFileStat* out) {
    struct _stat64 st;
    if (!name || !out || _wstat64(OEPlatform::Widen(name).c_str(), &st) != 0) return -1;
    out->size = static_cast<long long>(st.st_size);
    out->modifiedTime = static_cast<long long>(st.st_mtime);
    out->isDirectory = (st.st_mode & _S_IFDIR) ? 1u : 0u;
    return 0;
}
