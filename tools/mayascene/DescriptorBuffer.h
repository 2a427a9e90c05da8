// A stream buffer over a file descriptor, which remembers why a write failed.
#pragma once

#include <array>
#include <cstddef>
#include <streambuf>

namespace mayascene {

// The descriptor is the caller's and stays open as long as the buffer lives. What is written last goes out
// with sync().
class DescriptorBuffer : public std::streambuf {
 public:
  explicit DescriptorBuffer(int descriptor);

  int failure() const { return failure_; }  // the errno of the first write that failed; 0: none

 protected:
  int_type overflow(int_type letter) override;
  int sync() override;

 private:
  static constexpr std::size_t kSize = std::size_t{1} << 16;

  int descriptor_;
  int failure_ = 0;
  std::array<char, kSize> buffer_;
};

}  // namespace mayascene
