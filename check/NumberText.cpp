#include "check/NumberText.h"

#include <array>
#include <charconv>
#include <cmath>

namespace check {

std::string NumberText(double number) {
  constexpr double kLargest = 1e15;
  constexpr int kDecimals = 3;
  std::array<char, 64> text{};
  const bool plain = std::fabs(number) < kLargest;
  const auto end = plain ? std::to_chars(text.data(), text.data() + text.size(), number,
                                         std::chars_format::fixed, kDecimals)
                         : std::to_chars(text.data(), text.data() + text.size(), number);
  std::string shown(text.data(), end.ptr);
  if (!plain) return shown;
  shown.erase(shown.find_last_not_of('0') + 1);
  if (shown.back() == '.') shown.pop_back();
  return shown == "-0" ? "0" : shown;
}

}  // namespace check
