// A text whose terminating NUL is the last byte of memory that may be touched.
#pragma once

#include <cstddef>
#include <string_view>

namespace testsupport {

// Holds a copy of the text, a NUL after it, and a page after the NUL that nobody may read or write: a
// reader that goes one byte too far ends the process.
class GuardedText {
 public:
  explicit GuardedText(std::string_view text);
  ~GuardedText();
  GuardedText(const GuardedText&) = delete;
  GuardedText& operator=(const GuardedText&) = delete;

  const char* begin() const { return begin_; }
  const char* end() const { return end_; }  // the terminating NUL

 private:
  void* region_ = nullptr;
  std::size_t regionSize_ = 0;
  char* begin_ = nullptr;
  char* end_ = nullptr;
};

}  // namespace testsupport
