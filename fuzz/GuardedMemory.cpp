#include "fuzz/GuardedMemory.h"

#include <sys/mman.h>
#include <unistd.h>

#include <algorithm>
#include <cstring>

#include "fuzz/Require.h"

#if defined(__SANITIZE_ADDRESS__)
#define FUZZ_ADDRESS_SANITIZER
#elif defined(__has_feature)
#if __has_feature(address_sanitizer)
#define FUZZ_ADDRESS_SANITIZER
#endif
#endif
#if defined(FUZZ_ADDRESS_SANITIZER)
#include <sanitizer/asan_interface.h>
#else
#define ASAN_POISON_MEMORY_REGION(memory, size) (static_cast<void>(memory), static_cast<void>(size))
#define ASAN_UNPOISON_MEMORY_REGION(memory, size) (static_cast<void>(memory), static_cast<void>(size))
#endif

namespace fuzz {
namespace {

// How many bytes before the memory are forbidden.
constexpr std::size_t kForbiddenBefore = 64;

std::size_t PageSize() {
  static const auto size = static_cast<std::size_t>(sysconf(_SC_PAGESIZE));
  return size;
}

}  // namespace

GuardedMemory::~GuardedMemory() { Release(); }

char* GuardedMemory::Take(std::size_t size) {
  if (size + kForbiddenBefore > capacity_) Grow(size + kForbiddenBefore);
  char* const memory = region_ + capacity_ - size;
  ASAN_UNPOISON_MEMORY_REGION(region_, capacity_);
  ASAN_POISON_MEMORY_REGION(memory - kForbiddenBefore, kForbiddenBefore);
  return memory;
}

char* GuardedMemory::Hold(std::string_view text, std::size_t nuls) {
  char* const memory = Take(text.size() + nuls);
  std::copy(text.begin(), text.end(), memory);
  std::memset(memory + text.size(), 0, nuls);
  return memory;
}

void GuardedMemory::Grow(std::size_t size) {
  Release();
  const std::size_t page = PageSize();
  const std::size_t capacity = (2 * size + page - 1) / page * page;
  void* const region =
      mmap(nullptr, capacity + page, PROT_READ | PROT_WRITE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
  Require(region != MAP_FAILED, "there is memory for the input");
  region_ = static_cast<char*>(region);
  capacity_ = capacity;
  Require(mprotect(region_ + capacity_, page, PROT_NONE) == 0, "a page can be forbidden");
}

void GuardedMemory::Release() {
  if (region_ == nullptr) return;
  ASAN_UNPOISON_MEMORY_REGION(region_, capacity_);
  munmap(region_, capacity_ + PageSize());
  region_ = nullptr;
  capacity_ = 0;
}

}  // namespace fuzz
