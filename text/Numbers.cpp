#include "text/Numbers.h"

#include <array>
#include <charconv>
#include <cmath>

namespace text {

std::string ShortestNumber(double number) {
  std::array<char, 32> digits{};
  return {digits.data(), std::to_chars(digits.data(), digits.data() + digits.size(), number).ptr};
}

std::string RoundedNumber(double number) {
  constexpr double kLargest = 1e15;
  constexpr int kDecimals = 3;
  if (!(std::fabs(number) < kLargest)) return ShortestNumber(number);
  std::array<char, 32> digits{};
  const auto end = std::to_chars(digits.data(), digits.data() + digits.size(), number,
                                 std::chars_format::fixed, kDecimals);
  std::string shown(digits.data(), end.ptr);
  shown.erase(shown.find_last_not_of('0') + 1);
  if (shown.back() == '.') shown.pop_back();
  return shown == "-0" ? "0" : shown;
}

}  // namespace text
