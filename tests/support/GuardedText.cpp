#include "tests/support/GuardedText.h"

#include <sys/mman.h>
#include <unistd.h>

#include <algorithm>
#include <new>

namespace testsupport {

GuardedText::GuardedText(std::string_view text) {
  const std::size_t page = static_cast<std::size_t>(sysconf(_SC_PAGESIZE));
  const std::size_t readable = (text.size() + 1 + page - 1) / page * page;
  regionSize_ = readable + page;
  region_ = mmap(nullptr, regionSize_, PROT_READ | PROT_WRITE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
  if (region_ == MAP_FAILED) throw std::bad_alloc();
  char* const guard = static_cast<char*>(region_) + readable;
  if (mprotect(guard, page, PROT_NONE) != 0) {
    munmap(region_, regionSize_);
    throw std::bad_alloc();
  }
  end_ = guard - 1;
  begin_ = end_ - text.size();
  std::copy(text.begin(), text.end(), begin_);
  *end_ = '\0';
}

GuardedText::~GuardedText() { munmap(region_, regionSize_); }

}  // namespace testsupport
