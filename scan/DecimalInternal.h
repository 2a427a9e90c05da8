// Digits to an integer, and an integer divided by a power of ten: what the inline part of the conversion
// needs.
#pragma once

#include <array>
#include <bit>
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <limits>

#include "scan/ByteClasses.h"

namespace scan::decimal {

// How many digits always fit a 64-bit integer, and the largest such integer up to which all are doubles.
inline constexpr std::int64_t kMantissaDigits = 19;
inline constexpr std::uint64_t kExactMantissa = std::uint64_t{1} << std::numeric_limits<double>::digits;

// The powers of ten that are doubles exactly.
inline constexpr double kExactPowers[] = {1e0,  1e1,  1e2,  1e3,  1e4,  1e5,  1e6,  1e7,
                                          1e8,  1e9,  1e10, 1e11, 1e12, 1e13, 1e14, 1e15,
                                          1e16, 1e17, 1e18, 1e19, 1e20, 1e21, 1e22};
inline constexpr std::int64_t kMostExactPower = 22;

// 10 and more for what is no digit.
inline unsigned DigitOf(char c) { return static_cast<unsigned>(static_cast<unsigned char>(c)) - '0'; }

inline bool EndsNumber(char c, char terminator) { return IsWhiteSpace(c) || c == terminator; }

#if defined(__SIZEOF_INT128__)
inline constexpr auto kIntegerPowers = [] {
  std::array<std::uint64_t, kMantissaDigits + 1> powers{1};
  for (std::size_t i = 1; i != powers.size(); ++i) powers[i] = powers[i - 1] * 10;
  return powers;
}();

// The mantissa, which is not 0, divided by a power of ten that fits 64 bits: the quotient in at least 63
// bits, with its lowest bit set where something is left over, is rounded correctly when it becomes a double.
inline double Divide(std::uint64_t mantissa, std::int64_t power) {
  using Wide = unsigned __int128;
  constexpr int kFractionBits = 63;
  const std::uint64_t divisor = kIntegerPowers[static_cast<std::size_t>(power)];
  const int mantissaShift = std::countl_zero(mantissa);
  const int divisorShift = std::countl_zero(divisor);
  const Wide dividend = Wide{mantissa << mantissaShift} << kFractionBits;
  const std::uint64_t aligned = divisor << divisorShift;
  const auto quotient = static_cast<std::uint64_t>(dividend / aligned);
  const std::uint64_t rest = static_cast<std::uint64_t>(dividend) - quotient * aligned;
  const auto rounded = static_cast<double>(quotient | (rest != 0 ? 1 : 0));
  constexpr int kBias = 1023;
  constexpr int kMantissaBits = 52;
  const int scale = kBias + divisorShift - mantissaShift - kFractionBits;
  return rounded * std::bit_cast<double>(static_cast<std::uint64_t>(scale) << kMantissaBits);
}
#endif

// The mantissa divided by 10^power, at most 10^19, rounded correctly. False where that has to be done another
// way.
inline bool DivideByPower(std::uint64_t mantissa, std::int64_t power, double* value) {
  if (mantissa <= kExactMantissa) [[likely]] {
    *value = static_cast<double>(static_cast<std::int64_t>(mantissa)) / kExactPowers[power];
    return true;
  }
#if defined(__SIZEOF_INT128__)
  *value = Divide(mantissa, power);
  return true;
#else
  return false;
#endif
}

inline constexpr std::int64_t kWordSize = sizeof(std::uint64_t);
inline constexpr std::uint64_t kWordPowers[kWordSize + 1] = {1,      10,      100,      1000,     10000,
                                                             100000, 1000000, 10000000, 100000000};

// How many digits, at most eight, stand at the beginning of eight bytes, and their value.
[[gnu::always_inline]] inline std::int64_t LeadingDigits(const char* at, std::uint64_t* value) {
  constexpr std::uint64_t kEachByte = 0x0101010101010101;
  std::uint64_t bytes = 0;
  std::memcpy(&bytes, at, sizeof bytes);
  const std::uint64_t digits = bytes - '0' * kEachByte;
  // The lowest of the marked bytes is no digit; those above it may be marked by a carry.
  const std::uint64_t others = ((bytes + 0x46 * kEachByte) | digits) & (0x80 * kEachByte);
  const std::int64_t count = others == 0 ? kWordSize : std::countr_zero(others) / 8;
  *value = 0;
  if (count == 0) return 0;
  const std::uint64_t filled = digits << (8 * (kWordSize - count));  // zeros stand in front
  const std::uint64_t pairs = filled * 10 + (filled >> 8);
  constexpr std::uint64_t kEvery4 = 0x000000ff000000ff;
  *value = ((pairs & kEvery4) * (100 + (std::uint64_t{1000000} << 32)) +
            ((pairs >> 16) & kEvery4) * (1 + (std::uint64_t{10000} << 32))) >>
           32;
  return count;
}

// Appends the digits at `at` to the mantissa, which may overflow. Returns the first byte after them.
[[gnu::always_inline]] inline const char* AppendDigits(const char* at, const char* end,
                                                       std::uint64_t* mantissa) {
  if constexpr (std::endian::native == std::endian::little) {
    while (end - at >= kWordSize) {
      std::uint64_t value = 0;
      const std::int64_t count = LeadingDigits(at, &value);
      *mantissa = *mantissa * kWordPowers[count] + value;
      at += count;
      if (count < kWordSize || !IsDigit(*at)) return at;
    }
  }
  for (; IsDigit(*at); ++at) *mantissa = *mantissa * 10 + DigitOf(*at);
  return at;
}

// What ReadPlainNumber does where the number after the sign, which begins at `at`, is no short decimal.
const char* ReadLongPlainNumber(const char* at, const char* end, bool negative, char terminator,
                                double* value);

}  // namespace scan::decimal
