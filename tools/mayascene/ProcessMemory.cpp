#include "tools/mayascene/ProcessMemory.h"

#include <cstdint>
#include <cstdlib>

#if defined(__GLIBC__)
#include <malloc.h>
#include <sys/mman.h>
#include <unistd.h>
#endif

namespace mayascene {

#if defined(__GLIBC__)
namespace {

constexpr int kHeapReserve = 1 << 30;
constexpr int kUsualReserve = 1 << 20;
constexpr int kLargestHeapBlock = 32 << 20;  // the most that the C library takes
constexpr std::size_t kBeyondTheHeap = std::size_t{1} << 20;

}  // namespace

void useLargePages() {
  auto* const before = static_cast<char*>(sbrk(0));
  mallopt(M_MMAP_THRESHOLD, kLargestHeapBlock);
  mallopt(M_TRIM_THRESHOLD, INT32_MAX);
  mallopt(M_TOP_PAD, kHeapReserve);
  void* volatile extended = std::malloc(kBeyondTheHeap);
  std::free(extended);
  mallopt(M_TOP_PAD, kUsualReserve);
  auto* const after = static_cast<char*>(sbrk(0));
  if (after <= before) return;
  const auto page = static_cast<std::uintptr_t>(sysconf(_SC_PAGESIZE));
  auto* const first = before + (page - reinterpret_cast<std::uintptr_t>(before) % page) % page;
  madvise(first, static_cast<std::size_t>(after - first), MADV_HUGEPAGE);
}
#else
void useLargePages() {}
#endif

}  // namespace mayascene
