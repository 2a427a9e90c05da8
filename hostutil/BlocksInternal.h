// The memory of the lists: one block each, which grows.
#pragma once

#include <cstdint>

namespace hostutil {

// Gives the block room for newSize bytes, more than it had, and returns its address, which may be another.
// Null when there is no memory: the block then stays as it is. A null block of size 0 makes a new one. The
// contents are kept; what is added is not set.
void* GrowBlock(void* block, std::int64_t size, std::int64_t newSize);

// Ends a block of that size; null is accepted.
void FreeBlock(void* block, std::int64_t size);

}  // namespace hostutil
