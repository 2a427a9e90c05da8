// The number scanner and the comparison of ratios.
//
// A number goes through one pass, which checks its form and gathers its digits. Most become a double by one
// exact operation, or by one division that is rounded correctly; the rest are read again by std::from_chars,
// very long ones in a form of bounded length.
#include "hostutil/HostNumbers.h"

#include <algorithm>
#include <array>
#include <bit>
#include <charconv>
#include <cstddef>
#include <cstdlib>
#include <cstring>
#include <limits>
#include <system_error>

#include "hostapi/ErrorCodes.h"
#include "hostutil/RehearsalInternal.h"

namespace {

// How many digits always fit a 64-bit integer, and up to where such an integer is a double exactly.
constexpr int64_t kMantissaDigits = 19;
constexpr uint64_t kExactMantissa = uint64_t{1} << std::numeric_limits<double>::digits;

// The powers of ten that are doubles exactly.
constexpr double kExactPowers[] = {1e0,  1e1,  1e2,  1e3,  1e4,  1e5,  1e6,  1e7,  1e8,  1e9,  1e10, 1e11,
                                   1e12, 1e13, 1e14, 1e15, 1e16, 1e17, 1e18, 1e19, 1e20, 1e21, 1e22};
constexpr int64_t kMostExactPower = 22;

// Numbers of up to so many digits and of such exponents are read as they stand.
constexpr int64_t kPlainDigits = 400;
constexpr int64_t kPlainExponent = 4000;

// The halfway point of two doubles has at most 767 significant digits: of what lies behind these, it matters
// only whether it is zero.
constexpr int64_t kDecidingDigits = 770;

// Far from where a double begins and ends, as the exponent of the first digit.
constexpr int64_t kHugeExponent = 400;

// An explicit exponent is held here: one more digit still fits the type, and no text is long enough for its
// digits to make up for it.
constexpr int64_t kExponentLimit = 100'000'000'000'000'000;

// A longer number is left to the caller, who may have a limit of its own.
constexpr int64_t kLongestPlainNumber = 64;

bool IsDigit(char c) { return c >= '0' && c <= '9'; }

// 10 and more for what is no digit.
unsigned DigitOf(char c) { return static_cast<unsigned>(static_cast<unsigned char>(c)) - '0'; }

bool IsLetter(char c) { return (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z'); }

// A position in the text; at the end it reads as a NUL.
struct Cursor {
  const char* at;
  const char* end;

  char Peek(int64_t ahead = 0) const { return ahead < end - at ? at[ahead] : '\0'; }
};

// What the pass over an unsigned number found.
struct Decimal {
  const char* begin;
  const char* end;        // behind the exponent, where there is one
  uint64_t mantissa = 0;  // all digits; wrong where there are more than kMantissaDigits
  int64_t digits = 0;     // leading zeros among them
  int64_t fraction = 0;   // of them, behind the point
  int64_t exponent = 0;   // the explicit one
};

void ReadDigits(Cursor* cursor, Decimal* decimal) {
  const char* first = cursor->at;
  for (; cursor->at != cursor->end && IsDigit(*cursor->at); ++cursor->at) {
    decimal->mantissa = decimal->mantissa * 10 + static_cast<uint64_t>(*cursor->at - '0');
  }
  decimal->digits += cursor->at - first;
}

// Reads an exponent if there is a whole one; else moves nothing.
void ReadExponent(Cursor* cursor, Decimal* decimal) {
  if (cursor->Peek() != 'e' && cursor->Peek() != 'E') return;
  const char sign = cursor->Peek(1);
  const int64_t prefix = sign == '+' || sign == '-' ? 2 : 1;
  if (!IsDigit(cursor->Peek(prefix))) return;
  cursor->at += prefix;
  int64_t exponent = 0;
  for (; IsDigit(cursor->Peek()); ++cursor->at) {
    exponent = std::min(kExponentLimit, exponent * 10 + (*cursor->at - '0'));
  }
  decimal->exponent = sign == '-' ? -exponent : exponent;
}

// False when no number stands there.
bool ReadDecimal(Cursor* cursor, Decimal* decimal) {
  decimal->begin = cursor->at;
  ReadDigits(cursor, decimal);
  if (cursor->Peek() == '.') {
    ++cursor->at;
    const int64_t whole = decimal->digits;
    ReadDigits(cursor, decimal);
    decimal->fraction = decimal->digits - whole;
  }
  if (decimal->digits == 0) return false;
  ReadExponent(cursor, decimal);
  decimal->end = cursor->at;
  return true;
}

#if defined(__SIZEOF_INT128__)
constexpr auto kIntegerPowers = [] {
  std::array<uint64_t, kMantissaDigits + 1> powers{1};
  for (std::size_t i = 1; i != powers.size(); ++i) powers[i] = powers[i - 1] * 10;
  return powers;
}();

// The mantissa, which is not 0, divided by a power of ten that fits 64 bits: the quotient in at least 63
// bits, with its lowest bit set where something is left over, is rounded correctly when it becomes a double.
double Divide(uint64_t mantissa, int64_t power) {
  using Wide = unsigned __int128;
  constexpr int kFractionBits = 63;
  const uint64_t divisor = kIntegerPowers[static_cast<std::size_t>(power)];
  const int mantissaShift = std::countl_zero(mantissa);
  const int divisorShift = std::countl_zero(divisor);
  const Wide dividend = Wide{mantissa << mantissaShift} << kFractionBits;
  const uint64_t aligned = divisor << divisorShift;
  const auto quotient = static_cast<uint64_t>(dividend / aligned);
  const uint64_t rest = static_cast<uint64_t>(dividend) - quotient * aligned;
  const auto rounded = static_cast<double>(quotient | (rest != 0 ? 1 : 0));
  constexpr int kBias = 1023;
  constexpr int kMantissaBits = 52;
  const int scale = kBias + divisorShift - mantissaShift - kFractionBits;
  return rounded * std::bit_cast<double>(static_cast<uint64_t>(scale) << kMantissaBits);
}

#endif

// The mantissa divided by 10^power, at most 10^19, rounded correctly. False where that has to be done another
// way.
inline bool DivideByPower(uint64_t mantissa, int64_t power, double* value) {
  if (mantissa <= kExactMantissa) [[likely]] {
    *value = static_cast<double>(static_cast<int64_t>(mantissa)) / kExactPowers[power];
    return true;
  }
#if defined(__SIZEOF_INT128__)
  *value = Divide(mantissa, power);
  return true;
#else
  return false;
#endif
}

// One exact operation on two exact numbers is rounded correctly.
bool ConvertExactly(const Decimal& decimal, double* value) {
  if (decimal.digits > kMantissaDigits) return false;
  const int64_t power = decimal.exponent - decimal.fraction;
  if (power <= 0 && power >= -kMantissaDigits) return DivideByPower(decimal.mantissa, -power, value);
  if (decimal.mantissa > kExactMantissa || power < -kMostExactPower || power > kMostExactPower) return false;
  const auto mantissa = static_cast<double>(decimal.mantissa);
  *value = power < 0 ? mantissa / kExactPowers[-power] : mantissa * kExactPowers[power];
  return true;
}

// Reads the number in a form of bounded length: its deciding digits as an integer, with an exponent.
HostError ConvertCondensed(const Decimal& decimal, double* value) {
  constexpr int kExponentRoom = 32;
  char text[kDecidingDigits + 1 + kExponentRoom];
  int64_t kept = 0;
  int64_t leadingZeros = 0;
  bool remainder = false;
  int64_t seen = 0;
  for (const char* at = decimal.begin; seen < decimal.digits; ++at) {
    if (!IsDigit(*at)) continue;
    ++seen;
    if (kept == 0 && *at == '0') {
      ++leadingZeros;
    } else if (kept < kDecidingDigits) {
      text[kept++] = *at;
    } else {
      remainder = remainder || *at != '0';
    }
  }
  *value = 0.0;
  if (kept == 0) return HOST_ERR_NONE;
  // The power of ten of the first digit that is not zero.
  const int64_t leading = decimal.digits - decimal.fraction - leadingZeros - 1 + decimal.exponent;
  if (leading > kHugeExponent) return HOST_ERR_NUMBER_RANGE;
  if (leading < -kHugeExponent) return HOST_ERR_NONE;
  if (remainder) text[kept++] = '1';
  char* exponentAt = text + kept;
  *exponentAt++ = 'e';
  const auto written = std::to_chars(exponentAt, text + sizeof text, leading - (kept - 1));
  const auto read = std::from_chars(text, written.ptr, *value);
  if (read.ec == std::errc()) return HOST_ERR_NONE;
  *value = 0.0;
  return leading > 0 ? HOST_ERR_NUMBER_RANGE : HOST_ERR_NONE;
}

HostError Convert(const Decimal& decimal, double* value) {
  if (ConvertExactly(decimal, value)) return HOST_ERR_NONE;
  if (decimal.digits <= kPlainDigits && std::abs(decimal.exponent) <= kPlainExponent) {
    const auto read = std::from_chars(decimal.begin, decimal.end, *value);
    if (read.ec == std::errc()) return HOST_ERR_NONE;
  }
  return ConvertCondensed(decimal, value);
}

constexpr uint64_t kEachByte = 0x0101010101010101;

constexpr int64_t kWordSize = sizeof(uint64_t);
constexpr uint64_t kWordPowers[kWordSize + 1] = {1,      10,      100,      1000,     10000,
                                                 100000, 1000000, 10000000, 100000000};

// How many digits, at most eight, stand at the beginning of eight bytes, and their value.
[[gnu::always_inline]] inline int64_t LeadingDigits(const char* at, uint64_t* value) {
  uint64_t bytes = 0;
  std::memcpy(&bytes, at, sizeof bytes);
  const uint64_t digits = bytes - '0' * kEachByte;
  // The lowest of the marked bytes is no digit; those above it may be marked by a carry.
  const uint64_t others = ((bytes + 0x46 * kEachByte) | digits) & (0x80 * kEachByte);
  const int64_t count = others == 0 ? kWordSize : std::countr_zero(others) / 8;
  *value = 0;
  if (count == 0) return 0;
  const uint64_t filled = digits << (8 * (kWordSize - count));  // zeros stand in front
  const uint64_t pairs = filled * 10 + (filled >> 8);
  constexpr uint64_t kEvery4 = 0x000000ff000000ff;
  *value = ((pairs & kEvery4) * (100 + (uint64_t{1000000} << 32)) +
            ((pairs >> 16) & kEvery4) * (1 + (uint64_t{10000} << 32))) >>
           32;
  return count;
}

// Reads digits on to the mantissa, which may overflow.
[[gnu::always_inline]] inline const char* PlainDigits(const char* at, const char* end, uint64_t* mantissa) {
  if constexpr (std::endian::native == std::endian::little) {
    while (end - at >= kWordSize) {
      uint64_t value = 0;
      const int64_t count = LeadingDigits(at, &value);
      *mantissa = *mantissa * kWordPowers[count] + value;
      at += count;
      if (count < kWordSize || !IsDigit(*at)) return at;
    }
  }
  for (; IsDigit(*at); ++at) *mantissa = *mantissa * 10 + static_cast<uint64_t>(*at - '0');
  return at;
}

// The bytes that pairs of numbers are set apart by, and what may stand behind the last one.
enum Separator : uint8_t { kNoSeparator = 0, kBlank = 1, kEndOfCommand = 2 };

constexpr auto kSeparators = [] {
  std::array<uint8_t, 256> separators{};
  for (const char c : {' ', '\t', '\r', '\n'}) separators[static_cast<unsigned char>(c)] = kBlank;
  separators[';'] = kEndOfCommand;
  return separators;
}();

uint8_t SeparatorOf(char c) { return kSeparators[static_cast<unsigned char>(c)]; }

// Reads the rest of a plain number, whose digits up to a point were read. False when it has another form.
bool ScanRest(Cursor* cursor, Decimal* decimal) {
  if (*cursor->at == '.') {
    const char* const fraction = ++cursor->at;
    cursor->at = PlainDigits(fraction, cursor->end, &decimal->mantissa);
    decimal->fraction = cursor->at - fraction;
    decimal->digits += decimal->fraction;
  }
  if (SeparatorOf(*cursor->at) != kNoSeparator) return decimal->digits != 0;
  if (decimal->digits != 0) ReadExponent(cursor, decimal);
  return decimal->digits != 0 && SeparatorOf(*cursor->at) != kNoSeparator;
}

// Reads one number of plain form that is no short decimal. Null when there is none.
[[gnu::noinline]] const char* ScanLongPlain(const char* at, const char* end, bool negative, double* value) {
  Cursor cursor{at, end};
  Decimal decimal{};
  decimal.begin = at;
  ReadDigits(&cursor, &decimal);
  if (!ScanRest(&cursor, &decimal) || cursor.at - at > kLongestPlainNumber) return nullptr;
  decimal.end = cursor.at;
  double magnitude = 0.0;
  if (Convert(decimal, &magnitude) != HOST_ERR_NONE) return nullptr;
  *value = negative ? -magnitude : magnitude;
  return cursor.at;
}

// Passes over white space and reads one number of plain form; returns what stands behind it. Null, with
// nothing to rely on, when there is none. Short decimals, which most numbers of a scene are, are read right
// here.
[[gnu::always_inline]] inline const char* ScanPlain(const char* at, const char* end, double* value,
                                                    int32_t* lines) {
  for (; SeparatorOf(*at) == kBlank; ++at) *lines += *at == '\n' ? 1 : 0;
  const bool negative = *at == '-';
  const char* const first = at + (negative ? 1 : 0);
  uint64_t mantissa = 0;
  at = first;
  for (unsigned digit = DigitOf(*at); digit <= 9; digit = DigitOf(*++at)) mantissa = mantissa * 10 + digit;
  int64_t digits = at - first;
  int64_t fraction = 0;
  if (digits == 0 && *at != '.') return nullptr;
  if (*at == '.') {
    const char* const point = at++;
    at = PlainDigits(at, end, &mantissa);
    fraction = at - point - 1;
    digits += fraction;
  }
  const bool isShort = digits != 0 && digits <= kMantissaDigits && SeparatorOf(*at) != kNoSeparator;
  double magnitude = 0.0;
  if (!isShort || !DivideByPower(mantissa, fraction, &magnitude)) {
    return ScanLongPlain(first, end, negative, value);
  }
  *value = negative ? -magnitude : magnitude;
  return at;
}

bool OnlyLettersLeft(const Cursor& cursor) {
  const char* at = cursor.at;
  while (at != cursor.end && IsLetter(*at)) ++at;
  return at == cursor.end || *at == '\0';
}

}  // namespace

HostError HostNumberScan(const char* text, int64_t length, double* value) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_NumberScan, &code)) {
    hostutil::HandOutNothing(value);
    return code;
  }
  if (text == nullptr || value == nullptr) return HOST_ERR_UTILITY_NULL;
  Cursor cursor{text, text + std::max(length, int64_t{0})};
  const bool negative = cursor.Peek() == '-';
  if (negative || cursor.Peek() == '+') ++cursor.at;
  Decimal decimal{};
  if (!ReadDecimal(&cursor, &decimal) || !OnlyLettersLeft(cursor)) return HOST_ERR_NUMBER_SYNTAX;
  double magnitude = 0.0;
  const HostError code = Convert(decimal, &magnitude);
  if (code == HOST_ERR_NONE) *value = negative ? -magnitude : magnitude;
  return code;
}

int64_t HostNumberScanPairs(const char* text, const char* end, double (*pairs)[2], int64_t capacity,
                            const char** behind, int32_t* lineFeeds) {
  *behind = text;
  if (!hostutil::MayWorkInBulk()) return 0;
  int64_t count = 0;
  int32_t lines = 0;
  for (; count < capacity; ++count) {
    const char* at = ScanPlain(*behind, end, &pairs[count][0], &lines);
    if (at != nullptr) at = ScanPlain(at, end, &pairs[count][1], &lines);
    if (at == nullptr) break;
    *behind = at;
    *lineFeeds += lines;
    lines = 0;
  }
  hostutil::CountCalls(HOST_UTILITY_NumberScan, 2 * count);
  return count;
}

HostError HostRatioCompare(const HostRatio* a, const HostRatio* b, int32_t* order) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_RatioCompare, &code)) {
    hostutil::HandOutNothing(order);
    return code;
  }
  if (a == nullptr || b == nullptr || order == nullptr) return HOST_ERR_UTILITY_NULL;
  if (a->denominator == 0 || b->denominator == 0) return HOST_ERR_NUMBER_RANGE;
  // A signed and an unsigned 32-bit factor: the product always fits 64 bits.
  const int64_t left = int64_t{a->numerator} * int64_t{b->denominator};
  const int64_t right = int64_t{b->numerator} * int64_t{a->denominator};
  *order = left < right ? -1 : left > right ? 1 : 0;
  return HOST_ERR_NONE;
}
