// Blocks of memory that grow. Small ones are the allocator's. Large ones are made of whole large pages,
// because most of the time that a fresh block takes goes into its page faults; and they grow by taking their
// pages along, so that nothing is copied. A block that is moved to where its large pages would not lie on
// their boundaries would fall apart into small ones.
#include "hostutil/BlocksInternal.h"

#include <sys/mman.h>

#include <cstdint>
#include <cstdlib>
#include <cstring>

#include "hostutil/HostSetup.h"

namespace hostutil {
namespace {

constexpr std::int64_t kLargeBlock = std::int64_t{4} << 20;
constexpr std::int64_t kLargePage = std::int64_t{2} << 20;

bool IsLarge(std::int64_t size) { return size >= kLargeBlock; }

std::size_t WholePages(std::int64_t size) {
  constexpr auto page = static_cast<std::size_t>(kLargePage);
  return (static_cast<std::size_t>(size) + page - 1) / page * page;
}

// Addresses for `size` bytes from the boundary of a large page on; null when there are none.
char* ReservePages(std::size_t size) {
  constexpr auto page = static_cast<std::size_t>(kLargePage);
  if (size > PTRDIFF_MAX - page) return nullptr;
  void* const reserved =
      mmap(nullptr, size + page, PROT_READ | PROT_WRITE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
  if (reserved == MAP_FAILED) return nullptr;
  auto* const first = static_cast<char*>(reserved);
  const std::size_t before = (page - reinterpret_cast<std::uintptr_t>(first) % page) % page;
  if (before != 0) munmap(first, before);
  munmap(first + before + size, page - before);
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
