// Texts right before or right after a page that nobody may read.
#pragma once

#include <sys/mman.h>
#include <unistd.h>

#include <cstddef>
#include <cstdlib>
#include <cstring>
#include <new>
#include <string_view>

namespace testsupport {

// Where texts are put one after the other, with pages before and after them that nobody may read.
class TextRoom {
 public:
  TextRoom() : page_(static_cast<std::size_t>(sysconf(_SC_PAGESIZE))) {
    region_ = mmap(nullptr, kRoom + 2 * page_, PROT_READ | PROT_WRITE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
    if (region_ == MAP_FAILED) throw std::bad_alloc();
    first_ = static_cast<char*>(region_) + page_;
    guard_ = first_ + kRoom;
    if (mprotect(region_, page_, PROT_NONE) != 0 || mprotect(guard_, page_, PROT_NONE) != 0) std::abort();
  }
  ~TextRoom() { munmap(region_, kRoom + 2 * page_); }
  TextRoom(const TextRoom&) = delete;
  TextRoom& operator=(const TextRoom&) = delete;

  // Copies the text and a NUL to right after the page before. Returns the NUL's place.
  const char* PutFirst(std::string_view text) {
    std::memcpy(first_, text.data(), text.size());
    first_[text.size()] = '\0';
    return first_ + text.size();
  }

  // Copies the text to where its NUL is followed by `gap` bytes, then by the page. Returns the NUL's place.
  const char* Put(std::string_view text, std::size_t gap) {
    char* const end = guard_ - gap - 1;
    std::memcpy(end - text.size(), text.data(), text.size());
    *end = '\0';
    // A read of these bytes gives keywords, quotes and terminators.
    for (std::size_t i = 0; i < gap; ++i) end[1 + i] = "c \"/;-"[i % 6];
    return end;
  }

 private:
  static constexpr std::size_t kRoom = std::size_t{1} << 16;

  std::size_t page_;
  void* region_ = nullptr;
  char* first_ = nullptr;
  char* guard_ = nullptr;
};

}  // namespace testsupport
