#include "refhost/ProcessMemory.h"

#include <cstdint>
#include <cstdlib>

#if defined(__GLIBC__)
#include <malloc.h>
#include <unistd.h>

#include "hostutil/HostSetup.h"
#endif

namespace refhost {

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
  if (after > before) HostAdviseLargePages(before, after - before);
}
#else
void useLargePages() {}
#endif

}  // namespace refhost
