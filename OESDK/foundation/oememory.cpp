#include "foundation/oememory.h"
#include "foundation/internal/oepool.h"

#include "foundation/oethread.h"

#include <atomic>
#include <cstdint>
#include <cstdlib>
#include <cstring>

#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__)
#define OESDK_POOL_DIRECT 1
#elif defined(__has_feature)
#if __has_feature(address_sanitizer) || __has_feature(thread_sanitizer) || __has_feature(memory_sanitizer)
#define OESDK_POOL_DIRECT 1
#endif
#endif

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

// ---------------------------------------------------------------------------------------------
// The block pool
//
// Every block is preceded by one word: the slab it was cut from, or null for a block taken from
// the heap on its own (those start 16 bytes into their heap allocation). A slab counts the blocks
// cut from it that are still in use, plus one while it is some thread's current slab; whoever
// brings the count to zero gives the slab back. The thread that cuts from a slab adds to the
// count for many blocks at a time (its reserve) rather than once a block, so that cutting a block
// is no atomic operation; the reserve is given back with the slab.

namespace {

struct Slab {
    std::atomic<std::size_t> m_live;
    char* m_next;
    char* m_end;
    std::size_t m_reserve; // counted in m_live but not yet cut; read and written by the owner only
};

const std::size_t kAlign = 16;

inline Slab*& SlabOf(void* block) {
    return *reinterpret_cast<Slab**>(static_cast<char*>(block) - sizeof(Slab*));
}

void ReleaseSlab(Slab* slab, std::size_t count = 1) {
    if (slab->m_live.fetch_sub(count, std::memory_order_acq_rel) == count) {
        slab->~Slab();
        std::free(slab);
    }
}

// The owner lets go of its current slab: its own count and the reserve it did not use.
void ReleaseCurrentSlab(Slab* slab) {
    ReleaseSlab(slab, 1 + slab->m_reserve);
}

// The calling thread's current slab. Plain data, so that it can be read even while the thread's
// objects are being destroyed; the guard below hands the slab back when the thread ends, after
// which the thread takes its blocks from the heap.
struct Cursor {
    Slab* m_slab;
    bool m_ended;
};
#if defined(__ELF__)
// Initial-exec: the cursor is reached without a call into the dynamic linker on every block.
__attribute__((tls_model("initial-exec")))
#endif
thread_local Cursor t_cursor = {nullptr, false};

struct CursorGuard {
    ~CursorGuard() {
        if (t_cursor.m_slab) ReleaseCurrentSlab(t_cursor.m_slab);
        t_cursor.m_slab = nullptr;
        t_cursor.m_ended = true;
    }
};

void* HeapBlock(std::size_t bytes) {
    char* raw = static_cast<char*>(std::malloc(bytes + kAlign));
    if (!raw) return nullptr;
    void* block = raw + kAlign;
    SlabOf(block) = nullptr;
    return block;
}

#if !defined(OESDK_POOL_DIRECT)
const std::size_t kSlabBytes = 64 * 1024;
const std::size_t kReserveStep = 1024;
const std::size_t kSlabHeader = (sizeof(Slab) + kAlign - 1) / kAlign * kAlign;

inline char* SlabStart(Slab* slab) {
    return reinterpret_cast<char*>(slab) + kSlabHeader;
}

// A fresh current slab for the thread (the old one is let go). Null when memory is short.
Slab* NewCurrentSlab() {
    static thread_local CursorGuard guard;
    (void)guard;
    void* raw = std::malloc(kSlabBytes);
    if (!raw) return nullptr;
    Slab* slab = new (raw) Slab;
    slab->m_live.store(1, std::memory_order_relaxed);
    slab->m_next = SlabStart(slab);
    slab->m_end = static_cast<char*>(raw) + kSlabBytes;
    slab->m_reserve = 0;
    if (t_cursor.m_slab) ReleaseCurrentSlab(t_cursor.m_slab);
    t_cursor.m_slab = slab;
    return slab;
}
#endif

} // namespace

namespace {

#if !defined(OESDK_POOL_DIRECT)
// A block of `size` bytes (a multiple of 8) aligned to `align` from `slab`, which is started over
// first when everything cut from it is back; null when the block does not fit.
inline void* CutFrom(Slab* slab, std::size_t size, std::size_t align) {
    if (slab->m_live.load(std::memory_order_acquire) == 1 + slab->m_reserve) slab->m_next = SlabStart(slab);
    std::uintptr_t at = reinterpret_cast<std::uintptr_t>(slab->m_next) + sizeof(Slab*);
    at = (at + align - 1) & ~static_cast<std::uintptr_t>(align - 1);
    char* block = reinterpret_cast<char*>(at);
    if (block + size > slab->m_end) return nullptr;
    if (slab->m_reserve == 0) {
        slab->m_live.fetch_add(kReserveStep, std::memory_order_relaxed);
        slab->m_reserve = kReserveStep;
    }
    --slab->m_reserve;
    slab->m_next = block + size;
    SlabOf(block) = slab;
    return block;
}

// Everything but a cut from the current slab: the thread's first block, a full slab, a large
// block, a thread whose slab has been given back.
#if defined(__GNUC__)
__attribute__((noinline))
#endif
void* PoolCutSlow(std::size_t bytes, std::size_t align) {
    if (bytes > kPoolLargest || t_cursor.m_ended) return HeapBlock(bytes);
    Slab* slab = NewCurrentSlab();
    return slab ? CutFrom(slab, (bytes + 7) & ~std::size_t(7), align) : nullptr;
}
#endif

// A block of `bytes` aligned to `align` (8 or 16) with its slab word in front of it; null when
// memory is short (the callers report it).
inline void* PoolCut(std::size_t bytes, std::size_t align) {
#if !defined(OESDK_POOL_DIRECT)
    // A current slab means the thread has not ended.
    if (Slab* slab = t_cursor.m_slab) {
        if (bytes <= kPoolLargest) {
            if (void* block = CutFrom(slab, (bytes + 7) & ~std::size_t(7), align)) return block;
        }
    }
    return PoolCutSlow(bytes, align);
#else
    (void)align;
    return HeapBlock(bytes);
#endif
}

inline void* HookedCut(std::size_t bytes, std::size_t align) {
    const FailureHook hook = g_failureHook.load(std::memory_order_relaxed);
    void* block = (hook && hook(bytes)) ? nullptr : PoolCut(bytes, align);
    if (!block) ReportFailure();
    return block;
}

} // namespace

void* PoolAlloc(std::size_t bytes) {
    return HookedCut(bytes, 16);
}

void* PoolAllocBytes(std::size_t bytes) {
    return HookedCut(bytes, 8);
}

void* PoolAllocPlain(std::size_t bytes) {
    return PoolCut(bytes, 16);
}

void PoolFree(void* block) {
    if (!block) return;
    Slab* slab = SlabOf(block);
    if (!slab) {
        std::free(static_cast<char*>(block) - kAlign);
        return;
    }
    ReleaseSlab(slab);
}

} // namespace OEMemory
