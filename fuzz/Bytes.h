// Reads values from an input, first to last. Beyond its end all values are zero or empty, so that every input
// is usable.
#pragma once

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <string>
#include <string_view>

namespace fuzz {

inline std::string_view TextOf(const std::uint8_t* data, std::size_t size) {
  return {reinterpret_cast<const char*>(data), size};
}

class Bytes {
 public:
  Bytes(const std::uint8_t* data, std::size_t size) : left_(TextOf(data, size)) {}

  bool empty() const { return left_.empty(); }

  std::string_view TakeRun(std::size_t size) {
    const std::string_view run = left_.substr(0, size);
    left_.remove_prefix(run.size());
    return run;
  }

  // The bytes as they lie: for integers and doubles.
  template <typename Value>
  Value Take() {
    const std::string_view run = TakeRun(sizeof(Value));
    Value value{};
    std::memcpy(&value, run.data(), run.size());
    return value;
  }

  std::size_t TakeBelow(std::size_t bound) { return Take<std::uint8_t>() % bound; }

  // A byte with the length, then that many bytes.
  std::string TakeText() { return std::string(TakeRun(Take<std::uint8_t>())); }

 private:
  std::string_view left_;
};

}  // namespace fuzz
