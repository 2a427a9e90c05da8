#include "LimitedMemory.h"

#include <cstdint>
#include <cstdlib>
#include <new>

namespace {

constexpr std::int64_t kUnlimited = -1;

std::int64_t allocationsLeft = kUnlimited;
std::int64_t refused = 0;

}  // namespace

// The forms for arrays come down to these, or to a sanitizer's own.
void* operator new(std::size_t size) {
  if (allocationsLeft == 0) {
    ++refused;
    throw std::bad_alloc();
  }
  if (allocationsLeft > 0) --allocationsLeft;
  if (void* const memory = std::malloc(size != 0 ? size : 1)) return memory;
  throw std::bad_alloc();
}

void* operator new(std::size_t size, const std::nothrow_t&) noexcept {
  try {
    return operator new(size);
  } catch (const std::bad_alloc&) {
    return nullptr;
  }
}

void operator delete(void* memory) noexcept { std::free(memory); }
void operator delete(void* memory, std::size_t) noexcept { std::free(memory); }

namespace hostutil_tests {

LimitedMemory::LimitedMemory(std::int64_t allocations) {
  allocationsLeft = allocations;
  refused = 0;
}

LimitedMemory::~LimitedMemory() { allocationsLeft = kUnlimited; }

std::int64_t RefusedAllocations() { return refused; }

}  // namespace hostutil_tests
