#include "scan/Decimal.h"

#include <gtest/gtest.h>

#include <clocale>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <limits>
#include <string>
#include <vector>

#include "tests/support/TemporaryFolder.h"

namespace scan_tests {
namespace {

using scan::NumberStatus;

constexpr double kUntouched = 4711.25;

struct Scanned {
  NumberStatus status;
  double value;
};

Scanned Scan(const std::string& text) {
  double value = kUntouched;
  const NumberStatus status = scan::ReadNumber(text.data(), static_cast<std::int64_t>(text.size()), &value);
  return {status, value};
}

// Bit by bit, so that the sign of a zero counts.
bool SameBits(double a, double b) { return std::memcmp(&a, &b, sizeof a) == 0; }

void ExpectValue(const std::string& text, double expected) {
  const Scanned scanned = Scan(text);
  EXPECT_EQ(scanned.status, NumberStatus::Ok) << text;
  EXPECT_TRUE(SameBits(scanned.value, expected)) << text << " gives " << scanned.value;
}

void ExpectRefused(const std::string& text, NumberStatus status) {
  const Scanned scanned = Scan(text);
  EXPECT_EQ(scanned.status, status) << text;
  EXPECT_TRUE(SameBits(scanned.value, kUntouched)) << text;
}

TEST(DecimalTest, SignDigitsFractionAndExponentAreRead) {
  const struct {
    const char* text;
    double value;
  } cases[] = {
      {"0", 0.0},
      {"7", 7.0},
      {"+7", 7.0},
      {"-7", -7.0},
      {"007", 7.0},
      {"1.5", 1.5},
      {"-1.5", -1.5},
      {".5", 0.5},
      {"-.5", -0.5},
      {"+.5", 0.5},
      {"5.", 5.0},
      {"-5.", -5.0},
      {"5.e2", 500.0},
      {".5e1", 5.0},
      {"1e5", 1e5},
      {"1E5", 1e5},
      {"1e+5", 1e5},
      {"1e-5", 1e-5},
      {"1e05", 1e5},
      {"-2.5e-3", -2.5e-3},
      {"0.1", 0.1},
      {"29.97", 29.97},
      {"-0", -0.0},
      {"-0.0e5", -0.0},
      {"0e999999", 0.0},
      {"123456789012345678", 123456789012345678.0},
      {"0.30901699437494745", 0.30901699437494745},
      {"9007199254740993", 9007199254740992.0},
  };
  for (const auto& one : cases) ExpectValue(one.text, one.value);
}

TEST(DecimalTest, LettersAfterTheNumberAreIgnored) {
  const struct {
    const char* text;
    double value;
  } cases[] = {{"23.976fps", 23.976}, {"29.97df", 29.97}, {"1e", 1.0},   {"1E", 1.0},  {"1ex", 1.0},
               {"1e5x", 1e5},         {"1e5e", 1e5},      {"5.f", 5.0},  {"5.e", 5.0}, {".5fps", 0.5},
               {"25FPS", 25.0},       {"1inf", 1.0},      {"1nan", 1.0}, {"0x", 0.0},  {"-3Z", -3.0},
               {"2ee", 2.0},          {"25azAZ", 25.0}};
  for (const auto& one : cases) ExpectValue(one.text, one.value);
}

TEST(DecimalTest, AnythingElseIsNoNumber) {
  for (const char* text : {"",     "-",        "+",         "--x",      "--1",    "+-1",
                           "-+1",  "++1",      "0x10",      "1.#QNAN",  "1.#INF", ".",
                           "-.",   ".e5",      "e5",        "inf",      "-inf",   "nan",
                           "-nan", "NaN",      "Infinity",  "infinity", "1e+",    "1e-",
                           "1e+x", "1.2.3",    "1..2",      "1e5.5",    "1e5+1",  "1 ",
                           " 1",   "\t1",      "1\n",       "1,5",      "1_000",  "1-",
                           "1+1",  "x",        "fps",       "23fps1",   "1e5x6",  "1ee5",
                           "0b1",  "\xC2\xB5", "1\xC3\xA9", "1@",       "1[",     "1`",
                           "1{",   "1/",       "1:",        "(1)",      "1f/s",   "\x30\xEF\xBC\x91"}) {
    ExpectRefused(text, NumberStatus::Syntax);
  }
}

TEST(DecimalTest, EveryByteAfterTheNumberIsALetterOrRefused) {
  for (int byte = 1; byte < 256; ++byte) {
    const bool letter = (byte >= 'A' && byte <= 'Z') || (byte >= 'a' && byte <= 'z');
    const bool continues = (byte >= '0' && byte <= '9') || byte == '.';
    const Scanned scanned = Scan(std::string("1") + static_cast<char>(byte));
    EXPECT_EQ(scanned.status, letter || continues ? NumberStatus::Ok : NumberStatus::Syntax) << byte;
  }
}

TEST(DecimalTest, ATooLargeNumberIsOutOfRange) {
  for (const char* text : {"1e309", "-1e309", "1.7976931348623159e308", "1e99999999999999999999", "1e400x",
                           "17976931348623159000000e287"}) {
    ExpectRefused(text, NumberStatus::Range);
  }
  ExpectRefused("1" + std::string(309, '0'), NumberStatus::Range);
  ExpectRefused(std::string(5000, '9'), NumberStatus::Range);
  ExpectValue("1" + std::string(308, '0'), 1e308);
  ExpectValue("1.7976931348623157e308", std::numeric_limits<double>::max());
  ExpectValue("1.7976931348623158e308", std::numeric_limits<double>::max());
}

TEST(DecimalTest, UnderflowGivesZeroWithTheTextsSign) {
  ExpectValue("1e-400", 0.0);
  ExpectValue("-1e-400", -0.0);
  ExpectValue("2.4e-324", 0.0);
  ExpectValue("-2.4e-324", -0.0);
  ExpectValue("1e-99999999999999999999", 0.0);
  ExpectValue("0." + std::string(5000, '0') + "1", 0.0);
  ExpectValue("123456789e-340", 0.0);
}

TEST(DecimalTest, ADenormalStaysOne) {
  ExpectValue("4.9406564584124654e-324", std::numeric_limits<double>::denorm_min());
  ExpectValue("2.5e-324", std::numeric_limits<double>::denorm_min());
  ExpectValue("-5e-324", -std::numeric_limits<double>::denorm_min());
  ExpectValue("1e-310", 1e-310);
  ExpectValue("2.2250738585072011e-308", 2.2250738585072011e-308);
  ExpectValue("2.2250738585072014e-308", std::numeric_limits<double>::min());
}

TEST(DecimalTest, ALargeExponentAndManyDigitsMakeUpForEachOther) {
  const std::string zeros(100000, '0');
  ExpectValue("0." + zeros + "1e100001", 1.0);
  ExpectValue("25" + zeros + "e-100000", 25.0);
  ExpectValue("-1" + zeros + "e-100001fps", -0.1);
  ExpectValue(zeros + "12.5", 12.5);
  ExpectValue("12.5" + zeros, 12.5);
}

TEST(DecimalTest, ADigitFarBackDecidesTheRounding) {
  // Halfway between 1 and the next double: to even without, upward with anything after it.
  const std::string half = "1.00000000000000011102230246251565404236316680908203125";
  ExpectValue(half, 1.0);
  for (const std::size_t count : {std::size_t{10}, std::size_t{390}, std::size_t{800}, std::size_t{5000}}) {
    ExpectValue(half + std::string(count, '0'), 1.0);
    ExpectValue(half + std::string(count, '0') + "1", 1.0000000000000002);
  }
}

TEST(DecimalTest, NothingIsReadBeyondTheLength) {
  const char text[] = "12345";
  for (std::int64_t length = 1; length <= 5; ++length) {
    double value = kUntouched;
    EXPECT_EQ(scan::ReadNumber(text, length, &value), NumberStatus::Ok);
    EXPECT_EQ(value, std::stod(std::string(text, static_cast<std::size_t>(length))));
  }
  // Each is cut where more would change it; the memory ends with the length, so that a reader beyond it is
  // found.
  for (const std::string whole : {"1.5e-7fps", "-0.25", "+1E+10x", ".5", "1e"}) {
    for (std::size_t length = 0; length <= whole.size(); ++length) {
      const std::vector<char> exact(whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(length));
      double value = kUntouched;
      const char none = '\0';
      const NumberStatus cut =
          scan::ReadNumber(exact.empty() ? &none : exact.data(), static_cast<std::int64_t>(length), &value);
      EXPECT_EQ(cut, Scan(whole.substr(0, length)).status) << whole.substr(0, length);
    }
  }
}

TEST(DecimalTest, ANulEndsTheText) {
  ExpectValue(std::string("1.5\0garbage!", 12), 1.5);
  ExpectValue(std::string("1.5fps\0!", 8), 1.5);
  ExpectValue(std::string("1e\0"
                          "5",
                          4),
              1.0);
  ExpectValue(std::string("1\0"
                          "2",
                          3),
              1.0);
  ExpectRefused(std::string("\0"
                            "1",
                            2),
                NumberStatus::Syntax);
  ExpectRefused(std::string("-\0"
                            "1",
                            3),
                NumberStatus::Syntax);
  ExpectRefused(std::string("1e+\0"
                            "5",
                            5),
                NumberStatus::Syntax);
}

// A locale of the test's own, whose decimal point is a comma, in force as long as this is.
class DecimalComma {
 public:
  DecimalComma() {
    folder_.write("characters",
                  "<code_set_name> ANSI_X3.4-1968\n<comment_char> %\n<escape_char> /\n"
                  "CHARMAP\n<U0000>..<U007F> /x00\nEND CHARMAP\n");
    folder_.write("source",
                  "LC_NUMERIC\ndecimal_point \",\"\nthousands_sep \"\"\ngrouping -1\nEND LC_NUMERIC\n");
    // It warns of all that a locale has beside numbers, and ends with 1 for that.
    const std::string compile = "cd '" + folder_.path().string() +
                                "' && localedef --no-archive -c -f ./characters -i source ./comma >log 2>&1";
    static_cast<void>(std::system(compile.c_str()));
    setenv("LOCPATH", folder_.path().c_str(), 1);
    if (std::setlocale(LC_ALL, "comma") == nullptr) ADD_FAILURE() << compile << '\n' << folder_.read("log");
  }
  ~DecimalComma() {
    std::setlocale(LC_ALL, before_.c_str());
    unsetenv("LOCPATH");
  }
  DecimalComma(const DecimalComma&) = delete;
  DecimalComma& operator=(const DecimalComma&) = delete;

 private:
  const std::string before_ = std::setlocale(LC_ALL, nullptr);
  const testsupport::TemporaryFolder folder_;
};

TEST(DecimalTest, ALocaleWithADecimalCommaChangesNothing) {
  const DecimalComma locale;
  ASSERT_STREQ(std::localeconv()->decimal_point, ",");
  ExpectValue("1.5", 1.5);
  ExpectRefused("1,5", NumberStatus::Syntax);
}

TEST(DecimalTest, TimeIsLinearInTheLength) {
  const std::string digits(4000000, '7');
  ExpectRefused(digits, NumberStatus::Range);
  ExpectValue("0." + digits, 0.7777777777777778);
  ExpectValue(digits + "e-4000000", 0.7777777777777778);
  ExpectValue("1" + std::string(4000000, 'x'), 1.0);
  ExpectRefused("1e" + digits, NumberStatus::Range);
}

}  // namespace
}  // namespace scan_tests
