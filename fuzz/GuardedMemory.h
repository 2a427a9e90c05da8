// Memory that ends at a page that cannot be read or written: one byte too far ends the process.
#pragma once

#include <cstddef>
#include <string_view>

namespace fuzz {

// Made once and used from run to run, because making such pages takes longer than most runs. Where there is
// an address sanitizer, the bytes before the memory are forbidden too.
class GuardedMemory {
 public:
  GuardedMemory() = default;
  ~GuardedMemory();
  GuardedMemory(const GuardedMemory&) = delete;
  GuardedMemory& operator=(const GuardedMemory&) = delete;

  // The last `size` bytes before the forbidden page, until the next call. What they hold is unspecified.
  char* Take(std::size_t size);

  // The same, holding the text and `nuls` NULs after it.
  char* Hold(std::string_view text, std::size_t nuls);

 private:
  void Grow(std::size_t size);
  void Release();

  char* region_ = nullptr;
  std::size_t capacity_ = 0;  // bytes before the forbidden page
};

}  // namespace fuzz
