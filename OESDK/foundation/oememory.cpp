#include "foundation/oememory.h"

#include "foundation/oethread.h"

#include <atomic>
#include <cstdlib>
#include <cstring>

namespace OEMemory {

namespace {
std::atomic<FailureHook> g_failureHook{nullptr};
}

FailureHook SetFailureHook(FailureHook hook) {
    return g_failureHook.exchange(hook);
}

int ShouldFail(std::size_t bytes) {
    FailureHook hook = g_failureHook.load(std::memory_order_relaxed);
    return hook ? hook(bytes) : 0;
}

void ReportFailure() {
    OEThreadState::SetErrorCode(OETE_OUTOFMEMORY);
}

void* Malloc(std::size_t bytes) {
    void* p = ShouldFail(bytes) ? nullptr : std::malloc(bytes ? bytes : 1);
    if (!p) ReportFailure();
    return p;
}

void* Calloc(std::size_t bytes) {
    void* p = ShouldFail(bytes) ? nullptr : std::calloc(1, bytes ? bytes : 1);
    if (!p) ReportFailure();
    return p;
}

void* Realloc(void* block, std::size_t bytes) {
    void* p = ShouldFail(bytes) ? nullptr : std::realloc(block, bytes ? bytes : 1);
    if (!p) ReportFailure();
    return p;
}

void Free(void* block) {
    std::free(block);
}

} // namespace OEMemory
