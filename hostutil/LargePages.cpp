// Large pages for large blocks: page faults take most of the time that a fresh block needs.
#include <sys/mman.h>
#include <unistd.h>

#include <cstdint>

#include "hostutil/HostSetup.h"

namespace {

// Below this a block has no room for more than one large page.
constexpr std::int64_t kLargeBlock = std::int64_t{4} << 20;

}  // namespace

void HostAdviseLargePages(void* memory, std::int64_t size) {
#if defined(MADV_HUGEPAGE)
  if (memory == nullptr || size < kLargeBlock) return;
  const auto page = static_cast<std::uintptr_t>(sysconf(_SC_PAGESIZE));
  const auto first = (reinterpret_cast<std::uintptr_t>(memory) + page - 1) / page * page;
  const auto end =
      (reinterpret_cast<std::uintptr_t>(memory) + static_cast<std::uintptr_t>(size)) / page * page;
  madvise(reinterpret_cast<void*>(first), end - first, MADV_HUGEPAGE);
#else
  static_cast<void>(memory);
  static_cast<void>(size);
#endif
}
