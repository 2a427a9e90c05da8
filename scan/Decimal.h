// Decimal text to the nearest double, whatever the locale. Nothing here allocates or throws, and neither an
// infinity nor a NaN comes out.
#pragma once

#include <cstdint>

#include "scan/DecimalInternal.h"

namespace scan {

enum class NumberStatus {
  Ok,
  Syntax,  // the text is no number
  Range,   // the number is too large for a double
};

// Reads the one number that `length` bytes are (a NUL among them ends the text, a negative length is an empty
// text): an optional sign, decimal digits with an optional fraction and exponent (".5" and "5." too), then
// nothing or letters only, which are ignored ("23.976fps" is 23.976; "1e" is 1). Underflow gives 0 with the
// text's sign, a denormal stays one. Time is linear in the length.
//
// Writes *value only when it returns Ok. No other form is taken: "", "-", "--x", "0x10", "1.#QNAN" are
// Syntax.
NumberStatus ReadNumber(const char* text, std::int64_t length, double* value);

// Passes over white space and reads one number of plain form: digits with an optional "-", fraction and
// exponent, followed by white space or by `terminator`. Returns what stands right after the number; null,
// with nothing written, where the next word has another form, is longer than 64 bytes or runs into the end of
// the text. Every number that it takes has the value that ReadNumber gives it.
//
// For runs of numbers, of which scenes are made: it is inline, and short decimals are read right here. `end`
// is the text's terminating NUL; nothing after it is read.
[[gnu::always_inline]] inline const char* ReadPlainNumber(const char* at, const char* end, char terminator,
                                                          double* value) {
  using namespace decimal;
  while (IsWhiteSpace(*at)) ++at;
  const bool negative = *at == '-';
  const char* const first = at + (negative ? 1 : 0);
  std::uint64_t mantissa = 0;
  at = first;
  for (unsigned digit = DigitOf(*at); digit <= 9; digit = DigitOf(*++at)) mantissa = mantissa * 10 + digit;
  std::int64_t digits = at - first;
  std::int64_t fraction = 0;
  if (digits == 0 && *at != '.') return nullptr;
  if (*at == '.') {
    const char* const point = at++;
    at = AppendDigits(at, end, &mantissa);
    fraction = at - point - 1;
    digits += fraction;
  }
  const bool isShort = digits != 0 && digits <= kMantissaDigits && EndsNumber(*at, terminator);
  double magnitude = 0.0;
  if (!isShort || !DivideByPower(mantissa, fraction, &magnitude)) {
    return ReadLongPlainNumber(first, end, negative, terminator, value);
  }
  *value = negative ? -magnitude : magnitude;
  return at;
}

}  // namespace scan
