// Test helper: makes the library's allocations fail while an object of this class lives.
#ifndef OESDK_TESTS_ALLOC_FAILURE_H
#define OESDK_TESTS_ALLOC_FAILURE_H

#include "oesdk.h"

class FailAllocations {
public:
    // Fails every allocation after `allowed` successful ones.
    explicit FailAllocations(int allowed = 0) {
        s_remaining = allowed;
        m_previous = OEMemory::SetFailureHook(&Hook);
    }
    ~FailAllocations() { OEMemory::SetFailureHook(m_previous); }

private:
    static int Hook(std::size_t) { return s_remaining-- > 0 ? 0 : 1; }
    static inline int s_remaining = 0;
    OEMemory::FailureHook m_previous;
};

#endif
