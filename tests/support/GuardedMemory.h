// Memory between two pages that cannot be read or written: one byte too far ends the process.
#pragma once

#include <cstddef>
#include <string_view>

namespace testsupport {

// Made once and used from text to text, because making such pages takes longer than most tests of a text.
// What it holds stays until the next call of a function.
class GuardedMemory {
 public:
  // So many bytes from the end of the memory on, and no fewer, are forbidden.
  static constexpr std::size_t kForbiddenAfter = 4096;

  GuardedMemory() = default;
  ~GuardedMemory();
  GuardedMemory(const GuardedMemory&) = delete;
  GuardedMemory& operator=(const GuardedMemory&) = delete;

  // The last `size` bytes before the forbidden page. What they hold is unspecified. Where there is an address
  // sanitizer, the bytes before them are forbidden too.
  char* Take(std::size_t size);

  // The same, holding the text and `nuls` NULs after it.
  char* Hold(std::string_view text, std::size_t nuls);

  // Copies the text to where its NUL is followed by `gap` bytes, then by the page. The bytes before the text
  // may be read. Returns the NUL's place.
  const char* Put(std::string_view text, std::size_t gap);

  // Copies the text and a NUL to right after the page before. Returns the NUL's place.
  const char* PutFirst(std::string_view text);

 private:
  void Reserve(std::size_t size);
  void Release();

  char* first_ = nullptr;     // right after the page before
  std::size_t capacity_ = 0;  // bytes between the pages
};

// A copy of one text in memory of its own. Its NUL is the last byte that may be touched.
class GuardedText {
 public:
  explicit GuardedText(std::string_view text) : end_(memory_.Put(text, 0)), begin_(end_ - text.size()) {}

  const char* begin() const { return begin_; }
  const char* end() const { return end_; }  // the terminating NUL

 private:
  GuardedMemory memory_;
  const char* end_;
  const char* begin_;
};

}  // namespace testsupport
