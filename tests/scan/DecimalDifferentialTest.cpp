// The conversion against the C library's, over seeded texts. The program runs in the C locale.
#include <gtest/gtest.h>

#include <cmath>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <random>
#include <string>

#include "scan/Decimal.h"

namespace scan_tests {
namespace {

using scan::NumberStatus;

constexpr int kTexts = 200000;

using Random = std::mt19937_64;

int Pick(Random* random, int least, int most) {
  return std::uniform_int_distribution<int>(least, most)(*random);
}

std::string Digits(Random* random, int least, int most) {
  std::string digits;
  for (int count = Pick(random, least, most); count > 0; --count) {
    digits += static_cast<char>('0' + Pick(random, 0, 9));
  }
  return digits;
}

const char* Sign(Random* random) {
  const char* const signs[] = {"", "", "-", "+"};
  return signs[Pick(random, 0, 3)];
}

// A number in one of the forms of the grammar.
std::string Number(Random* random) {
  std::string text = Sign(random);
  const int digits = Pick(random, 0, 20) == 0 ? 60 : 20;
  switch (Pick(random, 0, 3)) {
    case 0:
      text += Digits(random, 1, digits);
      break;
    case 1:
      text += Digits(random, 1, digits) + ".";
      break;
    case 2:
      text += "." + Digits(random, 1, digits);
      break;
    default:
      text += Digits(random, 1, 8) + "." + Digits(random, 1, digits);
      break;
  }
  if (Pick(random, 0, 2) == 0) {
    text += Pick(random, 0, 1) == 0 ? "e" : "E";
    text += Sign(random);
    text += std::to_string(Pick(random, 0, 3) == 0 ? Pick(random, 280, 345) : Pick(random, 0, 30));
  }
  return text;
}

// The bits of a random double, in the form that gives them back.
std::string RoundTrip(Random* random) {
  double value = 0;
  do {
    const std::uint64_t bits = (*random)();
    std::memcpy(&value, &bits, sizeof value);
  } while (!std::isfinite(value));
  char text[64];
  std::snprintf(text, sizeof text, "%.*g", Pick(random, 15, 40), value);
  return text;
}

// What the scanner is to answer: the C library's value, judged by the rules for overflow.
void ExpectAgreement(const std::string& text) {
  const double expected = std::strtod(text.c_str(), nullptr);
  double value = 4711.25;
  const NumberStatus status = scan::ReadNumber(text.data(), static_cast<std::int64_t>(text.size()), &value);
  if (std::isinf(expected)) {
    ASSERT_EQ(status, NumberStatus::Range) << text;
    return;
  }
  ASSERT_EQ(status, NumberStatus::Ok) << text;
  ASSERT_EQ(std::memcmp(&value, &expected, sizeof value), 0) << text << ": " << value << " " << expected;
}

TEST(DecimalDifferentialTest, EveryNumberIsTheNearestDouble) {
  Random random(20240607);
  for (int i = 0; i < kTexts / 2; ++i) ASSERT_NO_FATAL_FAILURE(ExpectAgreement(Number(&random)));
}

TEST(DecimalDifferentialTest, EveryDoubleComesBackFromItsText) {
  Random random(19770525);
  for (int i = 0; i < kTexts / 2; ++i) ASSERT_NO_FATAL_FAILURE(ExpectAgreement(RoundTrip(&random)));
}

TEST(DecimalDifferentialTest, TextsFarTooLongAreTheNearestDoubleToo) {
  Random random(5);
  for (int i = 0; i < 2000; ++i) {
    std::string text = Digits(&random, 1, 900) + "." + Digits(&random, 1, 900);
    text += "e-" + std::to_string(Pick(&random, 0, 1300));
    ASSERT_NO_FATAL_FAILURE(ExpectAgreement(text));
  }
}

// Whatever the bytes: success gives a finite number, failure leaves the value alone.
TEST(DecimalDifferentialTest, NoTextGivesAnInfinityOrANaN) {
  Random random(42);
  const char alphabet[] = "0123456789+-.eExfinaINF#_ ,\xC3";
  int numbers = 0;
  for (int i = 0; i < kTexts; ++i) {
    std::string text;
    for (int length = Pick(&random, 0, 12); length > 0; --length) {
      text += alphabet[static_cast<std::size_t>(Pick(&random, 0, static_cast<int>(sizeof alphabet) - 1))];
    }
    double value = 4711.25;
    const NumberStatus status = scan::ReadNumber(text.data(), static_cast<std::int64_t>(text.size()), &value);
    if (status == NumberStatus::Ok) {
      ++numbers;
      ASSERT_TRUE(std::isfinite(value)) << text;
    } else {
      ASSERT_EQ(value, 4711.25) << text;
    }
  }
  EXPECT_GT(numbers, kTexts / 50) << "the texts hold numbers too";
}

}  // namespace
}  // namespace scan_tests
