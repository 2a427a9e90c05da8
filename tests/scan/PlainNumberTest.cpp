// Numbers of plain form, one after another.
#include <gtest/gtest.h>

#include <cstdint>
#include <cstring>
#include <random>
#include <string>
#include <string_view>
#include <vector>

#include "scan/Decimal.h"
#include "tests/support/GuardedMemory.h"

namespace scan_tests {
namespace {

struct Numbers {
  std::vector<double> values;
  std::ptrdiff_t taken;  // bytes up to right after the last number
};

// After the text's NUL nothing can be read, so that a byte too far ends the program.
class PlainNumberTest : public testing::Test {
 protected:
  Numbers Read(std::string_view text, char terminator = ';') {
    const char* const end = room_.Put(text, 0);
    const char* const begin = end - text.size();
    Numbers run{{}, 0};
    double value = 0.0;
    for (const char* at = begin;;) {
      at = scan::ReadPlainNumber(at, end, terminator, &value);
      if (at == nullptr) return run;
      run.values.push_back(value);
      run.taken = at - begin;
    }
  }

  testsupport::GuardedMemory room_;
};

using Values = std::vector<double>;

TEST_F(PlainNumberTest, NumbersAreReadUpToTheTerminator) {
  const Numbers run = Read(" 1 0.5 2 -0.25\n3 1e-3;");
  EXPECT_EQ(run.values, (Values{1, 0.5, 2, -0.25, 3, 1e-3}));
  EXPECT_EQ(run.taken, 21);
}

TEST_F(PlainNumberTest, TheTerminatorIsTheCallersOwn) {
  EXPECT_EQ(Read("1 2;", ',').values, (Values{1}));
  EXPECT_EQ(Read("1 2,", ',').values, (Values{1, 2}));
  EXPECT_EQ(Read("1 2;", ' ').values, (Values{1}));
}

TEST_F(PlainNumberTest, EveryWhiteSpacePartsAndNothingElseDoes) {
  EXPECT_EQ(Read("\t1\r\n2 \n\n 3\t4\n;").values, (Values{1, 2, 3, 4}));
  for (const char* other : {"\v", "\f", ",", "/", "\"", "(", "\x80"}) {
    const Numbers run = Read(std::string("7 1") + other + " 2 ;");
    EXPECT_EQ(run.values, (Values{7})) << other;
    EXPECT_EQ(run.taken, 1) << other;
  }
}

TEST_F(PlainNumberTest, WhatIsNotOfPlainFormIsLeftWhole) {
  for (const char* word : {"+2", "2x", "2fps", "\"2\"", "--2", "-", ".", "-.", "e5", "2e", "2e+", "1e999",
                           "nan", "2//", "#", "1.2.3", "1#2"}) {
    const Numbers run = Read(std::string("7 8 ") + word + " 3 4;");
    EXPECT_EQ(run.values, (Values{7, 8})) << word;
    EXPECT_EQ(run.taken, 3) << word;
  }
}

TEST_F(PlainNumberTest, EveryPlainFormIsTaken) {
  EXPECT_EQ(Read("5. .5 -.5 007 1E5 1e+05 -2.5e-3 ;").values, (Values{5, 0.5, -0.5, 7, 1e5, 1e5, -2.5e-3}));
  EXPECT_EQ(Read("12345678901234567890123 0.12345678901234567890123 9007199254740993 ;").values,
            (Values{1.2345678901234568e22, 0.12345678901234568, 9007199254740992.0}));
}

TEST_F(PlainNumberTest, ANumberOfMoreThan64BytesIsLeft) {
  for (const char* form : {"", "0.", "-0."}) {
    const std::string sign = *form == '-' ? "-" : "";
    const std::string longest(64 - (std::strlen(form) - sign.size()), '1');
    EXPECT_EQ(Read(form + longest + ";").values.size(), 1u) << form;
    EXPECT_TRUE(Read(form + longest + "1;").values.empty()) << form;
  }
}

TEST_F(PlainNumberTest, ANumberThatRunsIntoTheEndIsLeft) {
  const std::string text = "1 2.5 -3e2";
  for (std::size_t length = 0; length <= text.size(); ++length) {
    const std::size_t whole = length >= 6 ? 2 : length >= 2 ? 1 : 0;
    EXPECT_EQ(Read(std::string_view(text).substr(0, length)).values.size(), whole) << length;
  }
}

TEST_F(PlainNumberTest, WhereThereIsNoneNothingIsWritten) {
  const char* const end = room_.Put("2x ", 0);
  double value = 4711.25;
  EXPECT_EQ(scan::ReadPlainNumber(end - 3, end, ';', &value), nullptr);
  EXPECT_EQ(value, 4711.25);
}

TEST_F(PlainNumberTest, TheValuesAreThoseOfNumbersAlone) {
  std::mt19937_64 random(8);
  const auto pick = [&](int least, int most) {
    return std::uniform_int_distribution<int>(least, most)(random);
  };
  const auto number = [&] {
    std::string text = pick(0, 2) == 0 ? "-" : "";
    for (int i = pick(1, 12); i > 0; --i) text += static_cast<char>('0' + pick(0, 9));
    if (pick(0, 4) != 0) text += '.';
    if (text.back() == '.') {
      for (int i = pick(0, 25); i > 0; --i) text += static_cast<char>('0' + pick(0, 9));
    }
    if (pick(0, 4) == 0) text += (pick(0, 1) == 0 ? "e" : "E-") + std::to_string(pick(0, 30));
    return text;
  };
  for (int i = 0; i < 50000; ++i) {
    const std::string texts[] = {number(), number()};
    const Numbers run = Read(texts[0] + " " + texts[1] + ";");
    ASSERT_EQ(run.values.size(), 2u) << texts[0] << " " << texts[1];
    for (int n = 0; n < 2; ++n) {
      double alone = 0.0;
      ASSERT_EQ(scan::ReadNumber(texts[n].data(), static_cast<std::int64_t>(texts[n].size()), &alone),
                scan::NumberStatus::Ok);
      ASSERT_EQ(std::memcmp(&run.values[static_cast<std::size_t>(n)], &alone, sizeof alone), 0) << texts[n];
    }
  }
}

}  // namespace
}  // namespace scan_tests
