// Allocation used by the library's own containers (strings, buffers, arrays, indexes).
//
// Every allocation of the library goes through these functions so that a failure is reported
// the same way everywhere (the calling thread's error code 1). Tests can force failures with
// the failure hook; hosts never need it.
#ifndef OESDK_FOUNDATION_OEMEMORY_H
#define OESDK_FOUNDATION_OEMEMORY_H

#include "oeexport.h"

#include <cstddef>
#include <new>
#include <utility>

namespace OEMemory {

// Returns non-zero to make the allocation of `bytes` fail. Testing aid only.
typedef int (*FailureHook)(std::size_t bytes);
OE_API FailureHook SetFailureHook(FailureHook hook);
OE_API int ShouldFail(std::size_t bytes);

// malloc / realloc / free with the failure hook. On failure they set the calling thread's
// error code to 1 and return null (Realloc leaves the old block untouched, as realloc does).
OE_API void* Malloc(std::size_t bytes);
OE_API void* Calloc(std::size_t bytes);
OE_API void* Realloc(void* block, std::size_t bytes);
OE_API void Free(void* block);

// Records an allocation failure for the calling thread (error code 1).
OE_API void ReportFailure();

// Small blocks for what a parsed tree is made of (string buffers, data objects). A block of up to
// kPoolLargest bytes is cut from a slab of the calling thread's (one pointer bump); a slab goes
// back to the heap when its last block is freed, from whatever thread, and the thread's current
// slab starts over whenever everything cut from it has been freed. Larger blocks come from the
// heap. PoolAlloc's blocks are 16-byte aligned, PoolAllocBytes's (for text) 8-byte aligned. The
// failure hook and the error code apply as to Malloc.
// PoolFree takes only blocks of PoolAlloc or PoolAllocBytes (null is ignored). Under a sanitizer every block
// comes from the heap, so that its checks see each block on its own.
enum : std::size_t { kPoolLargest = 1024 };
OE_API void* PoolAlloc(std::size_t bytes);
OE_API void* PoolAllocBytes(std::size_t bytes);
OE_API void PoolFree(void* block);

// Creates an object without throwing: null (and error code 1) when memory is short.
template <class T, class... Args> T* New(Args&&... args) {
    if (ShouldFail(sizeof(T))) {
        ReportFailure();
        return nullptr;
    }
    T* p = new (std::nothrow) T(std::forward<Args>(args)...);
    if (!p) ReportFailure();
    return p;
}

} // namespace OEMemory

#endif
