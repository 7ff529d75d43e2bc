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
