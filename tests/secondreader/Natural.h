// Whole numbers of any size, as far as reading a decimal needs them.
#pragma once

#include <cstddef>
#include <cstdint>
#include <vector>

namespace secondreader {

class Natural {
 public:
  explicit Natural(std::uint32_t value = 0);

  // Becomes itself times the factor, plus the summand.
  void multiplyAndAdd(std::uint32_t factor, std::uint32_t summand);

  // Becomes itself times, or divided by, two to that power; what is left over is dropped.
  void doubled(std::size_t times);
  void halved(std::size_t times);

  // Becomes itself less the other one, which is not greater.
  void subtract(const Natural& other);

  // -1, 0 or 1.
  int compare(const Natural& other) const;

  bool isZero() const { return parts_.empty(); }

  // How many binary digits it has; 0 for 0.
  std::size_t bits() const;

 private:
  void dropLeadingZeros();

  std::vector<std::uint32_t> parts_;  // 32 binary digits each, the lowest first; the last one is not 0
};

// How often the divisor, which is not 0, fits, less than 2^64 times; the dividend becomes what is left over.
std::uint64_t divide(Natural* dividend, const Natural& divisor);

}  // namespace secondreader
