// The conversion of decimal text.
//
// A number goes through one pass, which checks its form and gathers its digits. Most become a double by one
// exact operation, or by one division that is rounded correctly; the rest are read again by std::from_chars,
// very long ones in a form of bounded length.
#include "scan/Decimal.h"

#include <algorithm>
#include <charconv>
#include <cstdlib>
#include <system_error>

namespace scan {

using namespace decimal;

namespace {

// Numbers of up to so many digits and of such exponents are read as they stand.
constexpr std::int64_t kPlainDigits = 400;
constexpr std::int64_t kPlainExponent = 4000;

// The halfway point of two doubles has at most 767 significant digits. Of the digits after these it matters
// only whether all are zero.
constexpr std::int64_t kDecidingDigits = 770;

// Beyond the range of a double on either side, as the power of ten of the first digit.
constexpr std::int64_t kHugeExponent = 400;

// An explicit exponent is held at this. One more digit still fits the type, and no text has enough digits to
// make up for such an exponent.
constexpr std::int64_t kExponentLimit = 100'000'000'000'000'000;

// A longer number is left to the caller, which may have a limit of its own.
constexpr std::int64_t kLongestPlainNumber = 64;

// A position in the text; at the end it reads as a NUL.
struct Cursor {
  const char* at;
  const char* end;

  char Peek(std::int64_t ahead = 0) const { return ahead < end - at ? at[ahead] : '\0'; }
};

// What the pass over an unsigned number found.
struct Decimal {
  const char* begin;
  const char* end;             // after the exponent, where there is one
  std::uint64_t mantissa = 0;  // all digits; wrong where there are more than kMantissaDigits
  std::int64_t digits = 0;     // leading zeros among them
  std::int64_t fraction = 0;   // of them, after the point
  std::int64_t exponent = 0;   // the explicit one
};

void ReadDigits(Cursor* cursor, Decimal* decimal) {
  const char* first = cursor->at;
  for (; cursor->at != cursor->end && IsDigit(*cursor->at); ++cursor->at) {
    decimal->mantissa = decimal->mantissa * 10 + DigitOf(*cursor->at);
  }
  decimal->digits += cursor->at - first;
}

// Reads an exponent if there is a whole one; else moves nothing.
void ReadExponent(Cursor* cursor, Decimal* decimal) {
  if (cursor->Peek() != 'e' && cursor->Peek() != 'E') return;
  const char sign = cursor->Peek(1);
  const std::int64_t prefix = sign == '+' || sign == '-' ? 2 : 1;
  if (!IsDigit(cursor->Peek(prefix))) return;
  cursor->at += prefix;
  std::int64_t exponent = 0;
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
    const std::int64_t whole = decimal->digits;
    ReadDigits(cursor, decimal);
    decimal->fraction = decimal->digits - whole;
  }
  if (decimal->digits == 0) return false;
  ReadExponent(cursor, decimal);
  decimal->end = cursor->at;
  return true;
}

// One exact operation on two exact numbers is rounded correctly.
bool ConvertExactly(const Decimal& decimal, double* value) {
  if (decimal.digits > kMantissaDigits) return false;
  const std::int64_t power = decimal.exponent - decimal.fraction;
  if (power <= 0 && power >= -kMantissaDigits) return DivideByPower(decimal.mantissa, -power, value);
  if (decimal.mantissa > kExactMantissa || power < -kMostExactPower || power > kMostExactPower) return false;
  const auto mantissa = static_cast<double>(decimal.mantissa);
  *value = power < 0 ? mantissa / kExactPowers[-power] : mantissa * kExactPowers[power];
  return true;
}

// Reads the number in a form of bounded length: its deciding digits as an integer, with an exponent.
NumberStatus ConvertCondensed(const Decimal& decimal, double* value) {
  constexpr int kExponentRoom = 32;
  char text[kDecidingDigits + 1 + kExponentRoom];
  std::int64_t kept = 0;
  std::int64_t leadingZeros = 0;
  bool remainder = false;
  std::int64_t seen = 0;
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
  if (kept == 0) return NumberStatus::Ok;
  // The power of ten of the first digit that is not zero.
  const std::int64_t leading = decimal.digits - decimal.fraction - leadingZeros - 1 + decimal.exponent;
  if (leading > kHugeExponent) return NumberStatus::Range;
  if (leading < -kHugeExponent) return NumberStatus::Ok;
  if (remainder) text[kept++] = '1';
  char* exponentAt = text + kept;
  *exponentAt++ = 'e';
  const auto written = std::to_chars(exponentAt, text + sizeof text, leading - (kept - 1));
  const auto read = std::from_chars(text, written.ptr, *value);
  if (read.ec == std::errc()) return NumberStatus::Ok;
  *value = 0.0;
  return leading > 0 ? NumberStatus::Range : NumberStatus::Ok;
}

NumberStatus Convert(const Decimal& decimal, double* value) {
  if (ConvertExactly(decimal, value)) return NumberStatus::Ok;
  if (decimal.digits <= kPlainDigits && std::abs(decimal.exponent) <= kPlainExponent) {
    const auto read = std::from_chars(decimal.begin, decimal.end, *value);
    if (read.ec == std::errc()) return NumberStatus::Ok;
  }
  return ConvertCondensed(decimal, value);
}

bool OnlyLettersLeft(const Cursor& cursor) {
  const char* at = cursor.at;
  while (at != cursor.end && IsLetter(*at)) ++at;
  return at == cursor.end || *at == '\0';
}

}  // namespace

const char* decimal::ReadLongPlainNumber(const char* at, const char* end, bool negative, char terminator,
                                         double* value) {
  Cursor cursor{at, end};
  Decimal decimal{};
  if (!ReadDecimal(&cursor, &decimal) || !EndsNumber(*cursor.at, terminator)) return nullptr;
  if (cursor.at - at > kLongestPlainNumber) return nullptr;
  double magnitude = 0.0;
  if (Convert(decimal, &magnitude) != NumberStatus::Ok) return nullptr;
  *value = negative ? -magnitude : magnitude;
  return cursor.at;
}

NumberStatus ReadNumber(const char* text, std::int64_t length, double* value) {
  Cursor cursor{text, text + std::max(length, std::int64_t{0})};
  const bool negative = cursor.Peek() == '-';
  if (negative || cursor.Peek() == '+') ++cursor.at;
  Decimal decimal{};
  if (!ReadDecimal(&cursor, &decimal) || !OnlyLettersLeft(cursor)) return NumberStatus::Syntax;
  double magnitude = 0.0;
  const NumberStatus status = Convert(decimal, &magnitude);
  if (status == NumberStatus::Ok) *value = negative ? -magnitude : magnitude;
  return status;
}

}  // namespace scan
