// Library-internal: the block pool as the data objects' operator new sees it (not installed).
#ifndef OESDK_FOUNDATION_INTERNAL_OEPOOL_H
#define OESDK_FOUNDATION_INTERNAL_OEPOOL_H

#include <cstddef>

namespace OEMemory {

// PoolAlloc without the failure hook and without setting the error code: the callers of `new`
// report a failure their own way.
void* PoolAllocPlain(std::size_t bytes);

} // namespace OEMemory

#endif
