// The memory of the lists: one block each, which grows.
#pragma once

#include <cstdint>

namespace hostutil {

// The block with room for newSize bytes, more than it had; may lie elsewhere. Null when there is no memory:
// the block then stays. A null block of size 0 makes a new one. What was in it is kept, the rest is not set.
void* GrowBlock(void* block, std::int64_t size, std::int64_t newSize);

// Ends a block of that size; null is accepted.
void FreeBlock(void* block, std::int64_t size);

}  // namespace hostutil
