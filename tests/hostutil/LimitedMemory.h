// Memory that runs out: operator new of the whole program, the library's included, made to fail.
#pragma once

#include <cstdint>

namespace hostutil_tests {

// While it lives, that many allocations by operator new succeed, and all others throw std::bad_alloc.
class LimitedMemory {
 public:
  explicit LimitedMemory(std::int64_t allocations);
  ~LimitedMemory();
  LimitedMemory(const LimitedMemory&) = delete;
  LimitedMemory& operator=(const LimitedMemory&) = delete;
};

// How many allocations the last LimitedMemory refused.
std::int64_t RefusedAllocations();

}  // namespace hostutil_tests
