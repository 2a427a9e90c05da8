#include "tests/support/GuardedMemory.h"

#include <sys/mman.h>
#include <unistd.h>

#include <algorithm>
#include <cstdlib>
#include <cstring>
#include <new>

#if defined(__SANITIZE_ADDRESS__)
#define GUARDED_ADDRESS_SANITIZER
#elif defined(__has_feature)
#if __has_feature(address_sanitizer)
#define GUARDED_ADDRESS_SANITIZER
#endif
#endif
#if defined(GUARDED_ADDRESS_SANITIZER)
#include <sanitizer/asan_interface.h>
#else
#define ASAN_POISON_MEMORY_REGION(memory, size) (static_cast<void>(memory), static_cast<void>(size))
#define ASAN_UNPOISON_MEMORY_REGION(memory, size) (static_cast<void>(memory), static_cast<void>(size))
#endif

namespace testsupport {
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
  Reserve(size + kForbiddenBefore);
  char* const memory = first_ + capacity_ - size;
  ASAN_POISON_MEMORY_REGION(memory - kForbiddenBefore, kForbiddenBefore);
  return memory;
}

char* GuardedMemory::Hold(std::string_view text, std::size_t nuls) {
  char* const memory = Take(text.size() + nuls);
  std::copy(text.begin(), text.end(), memory);
  std::memset(memory + text.size(), 0, nuls);
  return memory;
}

const char* GuardedMemory::Put(std::string_view text, std::size_t gap) {
  Reserve(text.size() + 1 + gap);
  char* const end = first_ + capacity_ - gap - 1;
  std::copy(text.begin(), text.end(), end - text.size());
  *end = '\0';
  // A read of these bytes gives keywords, quotes and terminators.
  for (std::size_t i = 0; i < gap; ++i) end[1 + i] = "c \"/;-"[i % 6];
  return end;
}

const char* GuardedMemory::PutFirst(std::string_view text) {
  Reserve(text.size() + 1);
  char* const end = std::copy(text.begin(), text.end(), first_);
  *end = '\0';
  return end;
}

// Makes room for so many bytes, all of which may be touched.
void GuardedMemory::Reserve(std::size_t size) {
  const std::size_t page = PageSize();
  if (size > capacity_) {
    Release();
    const std::size_t capacity = (2 * size + page - 1) / page * page;
    void* const region =
        mmap(nullptr, capacity + 2 * page, PROT_READ | PROT_WRITE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
    if (region == MAP_FAILED) throw std::bad_alloc();
    first_ = static_cast<char*>(region) + page;
    capacity_ = capacity;
    if (mprotect(region, page, PROT_NONE) != 0 || mprotect(first_ + capacity_, page, PROT_NONE) != 0)
      std::abort();
  }
  ASAN_UNPOISON_MEMORY_REGION(first_, capacity_);
}

void GuardedMemory::Release() {
  if (first_ == nullptr) return;
  ASAN_UNPOISON_MEMORY_REGION(first_, capacity_);
  munmap(first_ - PageSize(), capacity_ + 2 * PageSize());
  first_ = nullptr;
  capacity_ = 0;
}

}  // namespace testsupport
