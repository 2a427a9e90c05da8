// Large pages for large blocks: most of the time that a fresh block takes goes into its page faults.
#include <sys/mman.h>
#include <unistd.h>

#include <cstdint>

#include "hostutil/HostSetup.h"

namespace {

// Below this a block has no room for more than one large page.
constexpr int64_t kLargeBlock = int64_t{4} << 20;

}  // namespace

void HostAdviseLargePages(void* memory, int64_t size) {
#if defined(MADV_HUGEPAGE)
  if (memory == nullptr || size < kLargeBlock) return;
  const auto page = static_cast<uintptr_t>(sysconf(_SC_PAGESIZE));
  const auto first = (reinterpret_cast<uintptr_t>(memory) + page - 1) / page * page;
  const auto end = (reinterpret_cast<uintptr_t>(memory) + static_cast<uintptr_t>(size)) / page * page;
  madvise(reinterpret_cast<void*>(first), end - first, MADV_HUGEPAGE);
#else
  static_cast<void>(memory);
  static_cast<void>(size);
#endif
}
