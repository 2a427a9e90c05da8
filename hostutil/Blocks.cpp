// Blocks of memory that grow. Small ones come from the allocator. Large ones are made of whole large pages,
// because page faults take most of the time that a fresh block needs. They grow by moving their pages to a
// larger range of addresses, so that nothing is copied. The range begins on the boundary of a large page:
// elsewhere the system would split the large pages into small ones.
#include "hostutil/BlocksInternal.h"

#include <sys/mman.h>

#include <cstdint>
#include <cstdlib>
#include <cstring>

#include "hostutil/HostSetup.h"

namespace hostutil {
namespace {

constexpr std::int64_t kLargeBlock = std::int64_t{4} << 20;
constexpr std::size_t kLargePage = std::size_t{2} << 20;

bool IsLarge(std::int64_t size) { return size >= kLargeBlock; }

std::size_t WholePages(std::int64_t size) {
  return (static_cast<std::size_t>(size) + kLargePage - 1) / kLargePage * kLargePage;
}

// Addresses for `size` bytes from the boundary of a large page on; null when there are none.
char* ReservePages(std::size_t size) {
  if (size > PTRDIFF_MAX - kLargePage) return nullptr;
  void* const reserved =
      mmap(nullptr, size + kLargePage, PROT_READ | PROT_WRITE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
  if (reserved == MAP_FAILED) return nullptr;
  auto* const first = static_cast<char*>(reserved);
  const std::size_t before = (kLargePage - reinterpret_cast<std::uintptr_t>(first) % kLargePage) % kLargePage;
  if (before != 0) munmap(first, before);
  munmap(first + before + size, kLargePage - before);
  return first + before;
}

void* TakePages(std::int64_t size) {
  char* const block = ReservePages(WholePages(size));
  if (block != nullptr) HostAdviseLargePages(block, static_cast<std::int64_t>(WholePages(size)));
  return block;
}

void* MovePages(void* block, std::int64_t size, std::int64_t newSize) {
  if (WholePages(size) == WholePages(newSize)) return block;
  char* const target = ReservePages(WholePages(newSize));
  if (target == nullptr) return nullptr;
  const int how = MREMAP_MAYMOVE | MREMAP_FIXED;
  if (mremap(block, WholePages(size), WholePages(newSize), how, target) == MAP_FAILED) {
    munmap(target, WholePages(newSize));
    return nullptr;
  }
  return target;
}

}  // namespace

void* GrowBlock(void* block, std::int64_t size, std::int64_t newSize) {
  if (!IsLarge(newSize)) return std::realloc(block, static_cast<std::size_t>(newSize));
  if (IsLarge(size)) return MovePages(block, size, newSize);
  void* const grown = TakePages(newSize);
  if (grown == nullptr) return nullptr;
  if (block != nullptr) std::memcpy(grown, block, static_cast<std::size_t>(size));
  std::free(block);
  return grown;
}

void FreeBlock(void* block, std::int64_t size) {
  if (IsLarge(size)) {
    munmap(block, WholePages(size));
  } else {
    std::free(block);
  }
}

}  // namespace hostutil
