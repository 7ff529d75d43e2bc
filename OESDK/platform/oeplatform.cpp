// Parts of the platform layer that are the same on every OS: the host message log and the
// host's pump hook.
#include "platform/oeplatform.h"
#include "platform/internal/oepumphook.h"

#include <cstdarg>
#include <cstdio>

namespace OEPlatform {

namespace {
PumpHook g_pumpHook = nullptr;
void* g_pumpContext = nullptr;
} // namespace

PumpHook SetPumpHook(PumpHook hook, void* context) {
    PumpHook old = g_pumpHook;
    g_pumpHook = hook;
    g_pumpContext = context;
    return old;
}

int RunPumpHook() {
    return g_pumpHook && g_pumpHook(g_pumpContext) ? 1 : 0;
}

} // namespace OEPlatform

namespace Util {

void DefaultMessageFunctor(int severity, int subSeverity, const char* source, int line, const char* function,
                           const char* text) {
    std::fprintf(stderr, "OESDK[%d.%d] %s:%d %s: %s\n", severity, subSeverity, source ? source : "?", line,
                 function ? function : "?", text ? text : "");
}

Ops::Ops() : m_functor(&DefaultMessageFunctor) {}

MessageFunctor Ops::GetMessageFunctor() const {
    return m_functor;
}

MessageFunctor Ops::SetMessageFunctor(MessageFunctor functor) {
    MessageFunctor old = m_functor;
    m_functor = functor ? functor : &DefaultMessageFunctor;
    return old;
}

void Ops::Message(int severity, int subSeverity, const char* source, int line, const char* function,
                  const char* format, ...) {
    char text[1024] = "";
    if (format) {
        va_list args;
        va_start(args, format);
        std::vsnprintf(text, sizeof text, format, args);
        va_end(args);
    }
    m_functor(severity, subSeverity, source, line, function, text);
}

Ops& GetOps() {
    static Ops ops;
    return ops;
}

} // namespace Util
