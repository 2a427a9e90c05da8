#include "tests/secondreader/Numbers.h"

#include <algorithm>
#include <cmath>
#include <limits>
#include <string>

#include "hostapi/ErrorCodes.h"
#include "tests/secondreader/Natural.h"

namespace secondreader {
namespace {

constexpr int kSignificantBits = 53;
constexpr int kLowestPower = -1074;  // of two; the smallest double

bool isDigit(char c) { return c >= '0' && c <= '9'; }
bool isLetter(char c) { return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z'); }

// Takes the digits off the front.
std::string takeDigits(std::string_view* rest) {
  std::string digits;
  for (; !rest->empty() && isDigit(rest->front()); rest->remove_prefix(1)) digits += rest->front();
  return digits;
}

bool takeOne(std::string_view* rest, std::string_view letters) {
  if (rest->empty() || letters.find(rest->front()) == std::string_view::npos) return false;
  rest->remove_prefix(1);
  return true;
}

// The digits as a whole number, times a power of ten.
struct Decimal {
  std::string digits;
  long power = 0;
};

// An exponent of more digits counts as infinite: no text has enough digits to outweigh it.
constexpr std::size_t kLongestExponent = 9;

// Takes an exponent off the front, if a whole one stands there.
long takeExponent(std::string_view* rest) {
  std::string_view ahead = *rest;
  if (!takeOne(&ahead, "eE")) return 0;
  const bool negative = !ahead.empty() && ahead.front() == '-';
  takeOne(&ahead, "+-");
  std::string digits = takeDigits(&ahead);
  if (digits.empty()) return 0;
  *rest = ahead;
  digits.erase(0, std::min(digits.find_first_not_of('0'), digits.size() - 1));
  if (digits.size() > kLongestExponent) digits = std::string(kLongestExponent, '9');
  return negative ? -std::stol(digits) : std::stol(digits);
}

bool takeDecimal(std::string_view* rest, Decimal* decimal) {
  decimal->digits = takeDigits(rest);
  if (takeOne(rest, ".")) {
    const std::string fraction = takeDigits(rest);
    decimal->digits += fraction;
    decimal->power = -static_cast<long>(fraction.size());
  }
  if (decimal->digits.empty()) return false;
  decimal->power += takeExponent(rest);
  return true;
}

// The double nearest to numerator / denominator, both above 0; infinite beyond the largest.
//
// With the right power of two set apart, the quotient is a whole number of 53 binary digits and a rest, and
// the rest says which of the two neighbours is nearer.
double nearestQuotient(const Natural& numerator, const Natural& denominator) {
  const int length = static_cast<int>(numerator.bits()) - static_cast<int>(denominator.bits());
  for (int power = std::max(length - kSignificantBits, kLowestPower);; ++power) {
    Natural rest = numerator;
    Natural divisor = denominator;
    if (power < 0) {
      rest.doubled(static_cast<std::size_t>(-power));
    } else {
      divisor.doubled(static_cast<std::size_t>(power));
    }
    std::uint64_t quotient = divide(&rest, divisor);
    if (quotient >> kSignificantBits != 0) continue;
    rest.doubled(1);
    const int half = rest.compare(divisor);
    if (half > 0 || (half == 0 && quotient % 2 == 1)) ++quotient;
    return std::ldexp(static_cast<double>(quotient), power);
  }
}

double nearestDouble(const Decimal& decimal) {
  constexpr std::uint32_t kTen = 10;
  constexpr long kFarPower = 400;  // beyond the largest and the smallest double
  Natural numerator;
  for (const char digit : decimal.digits) {
    numerator.multiplyAndAdd(kTen, static_cast<std::uint32_t>(digit - '0'));
  }
  if (numerator.isZero()) return 0.0;
  // The power of ten that the first digit stands for.
  const std::size_t zeros = decimal.digits.find_first_not_of('0');
  const long first = decimal.power + static_cast<long>(decimal.digits.size() - zeros) - 1;
  if (first < -kFarPower) return 0.0;
  if (first > kFarPower) return std::numeric_limits<double>::infinity();
  Natural denominator(1);
  for (long power = 0; power < decimal.power; ++power) numerator.multiplyAndAdd(kTen, 0);
  for (long power = 0; power > decimal.power; --power) denominator.multiplyAndAdd(kTen, 0);
  return nearestQuotient(numerator, denominator);
}

}  // namespace

HostError readNumber(std::string_view text, double* value) {
  const bool negative = !text.empty() && text.front() == '-';
  takeOne(&text, "+-");
  Decimal decimal;
  if (!takeDecimal(&text, &decimal)) return HOST_ERR_NUMBER_SYNTAX;
  if (!std::all_of(text.begin(), text.end(), isLetter)) return HOST_ERR_NUMBER_SYNTAX;
  const double size = nearestDouble(decimal);
  if (std::isinf(size)) return HOST_ERR_NUMBER_RANGE;
  *value = negative ? -size : size;
  return HOST_ERR_NONE;
}

int compareRatios(const HostRatio& a, const HostRatio& b) {
  const bool negative = a.numerator < 0;
  if (negative != (b.numerator < 0)) return negative ? -1 : 1;
  const auto product = [](std::int32_t numerator, std::uint32_t denominator) {
    Natural size(numerator < 0 ? 0u - static_cast<std::uint32_t>(numerator)
                               : static_cast<std::uint32_t>(numerator));
    size.multiplyAndAdd(denominator, 0);
    return size;
  };
  const int order = product(a.numerator, b.denominator).compare(product(b.numerator, a.denominator));
  return negative ? -order : order;
}

std::int32_t wholePart(double value) {
  if (std::isnan(value)) return 0;
  const double least = std::numeric_limits<std::int32_t>::min();
  const double most = std::numeric_limits<std::int32_t>::max();
  return static_cast<std::int32_t>(std::clamp(std::trunc(value), least, most));
}

std::uint32_t wholePartUnsigned(double value) {
  if (std::isnan(value)) return 0;
  const double most = std::numeric_limits<std::uint32_t>::max();
  return static_cast<std::uint32_t>(std::clamp(std::trunc(value), 0.0, most));
}

}  // namespace secondreader
