// Compares the number scanner, for one number and for runs, with the C library's conversion; and checks the
// comparison of ratios.
#include <bit>
#include <cmath>
#include <cstdint>
#include <cstdlib>
#include <string>
#include <string_view>

#include "fuzz/Bytes.h"
#include "fuzz/Require.h"
#include "fuzz/Target.h"
#include "hostapi/ErrorCodes.h"
#include "hostutil/HostNumbers.h"
#include "tests/support/GuardedMemory.h"

namespace {

using fuzz::Require;

bool IsDigit(char c) { return c >= '0' && c <= '9'; }
bool IsLetter(char c) { return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z'); }
bool IsBlank(char c) { return c == ' ' || c == '\t' || c == '\r' || c == '\n'; }
bool SameBits(double a, double b) {
  return std::bit_cast<std::uint64_t>(a) == std::bit_cast<std::uint64_t>(b);
}

struct Scanned {
  HostError code = HOST_ERR_NUMBER_SYNTAX;
  double value = 0.0;
};

std::size_t DigitsAt(std::string_view text, std::size_t at) {
  std::size_t count = 0;
  while (at + count < text.size() && IsDigit(text[at + count])) ++count;
  return count;
}

// The length of the exponent at the place; 0 where there is no whole one.
std::size_t ExponentAt(std::string_view text, std::size_t at) {
  if (at >= text.size() || (text[at] != 'e' && text[at] != 'E')) return 0;
  const bool sign = at + 1 < text.size() && (text[at + 1] == '+' || text[at + 1] == '-');
  const std::size_t prefix = sign ? 2 : 1;
  const std::size_t digits = DigitsAt(text, at + prefix);
  return digits == 0 ? 0 : prefix + digits;
}

// The expected result: the form as documented, the value by the C library.
Scanned Expected(std::string_view text) {
  text = text.substr(0, text.find('\0'));
  std::size_t at = !text.empty() && (text[0] == '-' || text[0] == '+') ? 1 : 0;
  const std::size_t whole = DigitsAt(text, at);
  at += whole;
  std::size_t fraction = 0;
  if (at < text.size() && text[at] == '.') {
    fraction = DigitsAt(text, at + 1);
    at += 1 + fraction;
  }
  if (whole + fraction == 0) return {};
  at += ExponentAt(text, at);
  const std::string number(text.substr(0, at));
  for (; at < text.size(); ++at) {
    if (!IsLetter(text[at])) return {};
  }
  const double value = std::strtod(number.c_str(), nullptr);
  if (std::isinf(value)) return {HOST_ERR_NUMBER_RANGE, 0.0};
  return {HOST_ERR_NONE, value};
}

void CheckScan(testsupport::GuardedMemory& memory, std::string_view text) {
  constexpr double kUntouched = -123.25;
  double value = kUntouched;
  const HostError code = HostNumberScan(memory.Hold(text, 0), static_cast<std::int64_t>(text.size()), &value);
  const Scanned expected = Expected(text);
  Require(code == expected.code, "the scanner takes what is a number, and nothing else");
  Require(SameBits(value, code == HOST_ERR_NONE ? expected.value : kUntouched),
          "the double is the nearest one");
}

void CheckTruncation(double value) {
  const double signedValue = TruncateToInt32(value);
  const double unsignedValue = TruncateToUInt32(value);
  const double whole = std::isnan(value) ? 0.0 : std::trunc(value);
  Require(std::fmin(std::fmax(whole, -2147483648.0), 2147483647.0) - signedValue == 0.0,
          "truncated to 32 bits");
  Require(std::fmin(std::fmax(whole, 0.0), 4294967295.0) - unsignedValue == 0.0,
          "truncated to 32 bits, unsigned");
}

// Each number that was taken stands in the text, has the value that the scanner gives it alone, and is
// followed by white space or the terminator.
void CheckRun(testsupport::GuardedMemory& memory, std::string_view text, char terminator) {
  constexpr std::int64_t kCapacity = 16;
  double numbers[kCapacity];
  const char* const begin = memory.Hold(text, 1);
  const char* const end = begin + text.size();
  const char* after = nullptr;
  std::int64_t count = -1;
  const HostError code = HostNumberScanRun(begin, end, terminator, numbers, kCapacity, &count, &after);
  Require(code == HOST_ERR_NONE, "a run that nothing fails ends well");
  Require(count >= 0 && count <= kCapacity, "no more numbers than there is room for");
  const char* at = begin;
  for (std::int64_t i = 0; i < count; ++i) {
    while (at != end && IsBlank(*at)) ++at;
    const char* const first = at;
    while (at != end && !IsBlank(*at) && *at != terminator) ++at;
    Require(at != end, "a number of a run is followed by white space or the terminator");
    const Scanned alone = Expected({first, static_cast<std::size_t>(at - first)});
    Require(alone.code == HOST_ERR_NONE && SameBits(alone.value, numbers[i]),
            "a number of a run is what it is alone");
  }
  Require(after == at, "the run ends where its last number does");
}

void CheckRatios(fuzz::Bytes bytes) {
  const auto a = bytes.Take<HostRatio>();
  const auto b = bytes.Take<HostRatio>();
  std::int32_t order = 0;
  std::int32_t reverse = 0;
  const HostError code = HostRatioCompare(&a, &b, &order);
  Require(HostRatioCompare(&b, &a, &reverse) == code && order == -reverse, "an order has two sides");
  if (code != HOST_ERR_NONE) return;
  // Such a product fits the 64 bits that a long double has at the least.
  const long double left = static_cast<long double>(a.numerator) * b.denominator;
  const long double right = static_cast<long double>(b.numerator) * a.denominator;
  Require(order == (left < right ? -1 : left > right ? 1 : 0), "ratios are compared exactly");
}

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  static testsupport::GuardedMemory memory;
  const std::string_view text = fuzz::TextOf(data, size);
  CheckScan(memory, text);
  CheckScan(memory, text.substr(0, text.find_first_of(" ;\n")));
  CheckRun(memory, text, ';');
  CheckRun(memory, text, ',');
  CheckTruncation(fuzz::Bytes(data, size).Take<double>());
  CheckRatios(fuzz::Bytes(data, size));
  return 0;
}
