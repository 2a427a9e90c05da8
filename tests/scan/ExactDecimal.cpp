#include "tests/scan/ExactDecimal.h"

#include <algorithm>
#include <vector>

namespace scan_tests {
namespace {

// Nine decimal digits a limb, the lowest first.
using Limbs = std::vector<std::uint32_t>;
constexpr std::uint64_t kLimb = 1'000'000'000;
constexpr int kLimbDigits = 9;

void Multiply(Limbs* limbs, std::uint64_t factor) {
  std::uint64_t carry = 0;
  for (std::uint32_t& limb : *limbs) {
    carry += limb * factor;
    limb = static_cast<std::uint32_t>(carry % kLimb);
    carry /= kLimb;
  }
  for (; carry != 0; carry /= kLimb) limbs->push_back(static_cast<std::uint32_t>(carry % kLimb));
}

// Factors of as many as fit 32 bits at once.
void MultiplyByPower(Limbs* limbs, std::uint32_t base, int power, int atOnce) {
  while (power > 0) {
    std::uint64_t factor = 1;
    for (int i = std::min(power, atOnce); i > 0; --i, --power) factor *= base;
    Multiply(limbs, factor);
  }
}

std::string Digits(const Limbs& limbs) {
  std::string digits(limbs.size() * kLimbDigits, '0');
  auto at = digits.rbegin();
  for (std::uint32_t limb : limbs) {
    for (int i = 0; i < kLimbDigits; ++i, limb /= 10) *at++ = static_cast<char>('0' + limb % 10);
  }
  return digits.substr(std::min(digits.find_first_not_of('0'), digits.size() - 1));
}

}  // namespace

std::string ExactDecimal(std::uint64_t significand, int exponent) {
  Limbs limbs{1};
  Multiply(&limbs, significand >> 32);
  Multiply(&limbs, std::uint64_t{1} << 32);
  std::uint64_t carry = significand & 0xffffffff;
  for (std::size_t i = 0; carry != 0; ++i) {
    if (i == limbs.size()) limbs.push_back(0);
    carry += limbs[i];
    limbs[i] = static_cast<std::uint32_t>(carry % kLimb);
    carry /= kLimb;
  }
  if (exponent >= 0) {
    MultiplyByPower(&limbs, 2, exponent, 31);
    return Digits(limbs);
  }
  // A half is five tenths.
  MultiplyByPower(&limbs, 5, -exponent, 13);
  std::string digits = Digits(limbs);
  const auto fraction = static_cast<std::size_t>(-exponent);
  if (digits.size() <= fraction) digits.insert(0, fraction + 1 - digits.size(), '0');
  return digits.insert(digits.size() - fraction, 1, '.');
}

}  // namespace scan_tests
