#include <gtest/gtest.h>

#include <array>
#include <cstring>
#include <random>
#include <string>
#include <vector>

#include "UtilityTest.h"
#include "hostutil/HostNumbers.h"
#include "tests/support/GuardedText.h"

namespace hostutil_tests {
namespace {

constexpr int64_t kCapacity = 64;

struct Pairs {
  std::vector<std::array<double, 2>> values;
  int64_t taken;  // bytes up to *behind
  int32_t lineFeeds;
};

// Behind the text nothing can be read, so that a byte too far ends the program.
Pairs Scan(const std::string& text, int64_t capacity = kCapacity) {
  const testsupport::GuardedText guarded(text);
  double pairs[kCapacity][2] = {};
  const char* behind = nullptr;
  int32_t lineFeeds = 0;
  const int64_t count =
      HostNumberScanPairs(guarded.begin(), guarded.end(), pairs, capacity, &behind, &lineFeeds);
  Pairs result{{}, behind - guarded.begin(), lineFeeds};
  for (int64_t i = 0; i < count; ++i) result.values.push_back({pairs[i][0], pairs[i][1]});
  return result;
}

using Values = std::vector<std::array<double, 2>>;

class HostNumberPairsTest : public UtilityTest {};

TEST_F(HostNumberPairsTest, PairsAreReadUpToWhatIsNoNumber) {
  const Pairs pairs = Scan(" 1 0.5 2 -0.25\n3 1e-3;");
  EXPECT_EQ(pairs.values, (Values{{1, 0.5}, {2, -0.25}, {3, 1e-3}}));
  EXPECT_EQ(pairs.taken, 21);
  EXPECT_EQ(pairs.lineFeeds, 1);
}

TEST_F(HostNumberPairsTest, EveryWhiteSpaceParts) {
  const Pairs pairs = Scan("\t1\r\n2 \n\n 3\t4\n;");
  EXPECT_EQ(pairs.values, (Values{{1, 2}, {3, 4}}));
  EXPECT_EQ(pairs.lineFeeds, 3) << "those behind the last number are not counted";
}

TEST_F(HostNumberPairsTest, ANumberWithoutItsPartnerIsLeft) {
  const Pairs pairs = Scan("1 2\n3\n;");
  EXPECT_EQ(pairs.values, (Values{{1, 2}}));
  EXPECT_EQ(pairs.taken, 3);
  EXPECT_EQ(pairs.lineFeeds, 0);
}

TEST_F(HostNumberPairsTest, NoMoreThanTheCapacityIsRead) {
  const Pairs pairs = Scan("1 2 3 4 5 6 ;", 2);
  EXPECT_EQ(pairs.values, (Values{{1, 2}, {3, 4}}));
  EXPECT_EQ(pairs.taken, 7);
  EXPECT_TRUE(Scan("1 2 ;", 0).values.empty());
}

TEST_F(HostNumberPairsTest, WhatIsNotOfPlainFormIsLeft) {
  for (const char* second : {"+2", "2x", "2fps", "\"2\"", "--2", "-", ".", "e5", "2e", "2e+", "1e999", "nan",
                             "2,", "2//", "#", ""}) {
    const Pairs pairs = Scan(std::string("7 8 1 ") + second + " 3 4;");
    ASSERT_FALSE(pairs.values.empty()) << second;
    EXPECT_EQ(pairs.values[0], (std::array<double, 2>{7, 8})) << second;
    if (*second == '\0') continue;  // the numbers behind make the pair
    EXPECT_EQ(pairs.values.size(), 1u) << second;
    EXPECT_EQ(pairs.taken, 3) << second;
  }
}

TEST_F(HostNumberPairsTest, ANumberTooLongForPlainFormIsLeft) {
  EXPECT_TRUE(Scan("1 " + std::string(255, '1') + ";").values.empty());
}

TEST_F(HostNumberPairsTest, ANumberThatRunsIntoTheEndIsLeft) {
  const std::string text = "1 2 3 4";
  EXPECT_EQ(Scan(text).values, (Values{{1, 2}}));
  for (std::size_t length = 0; length <= text.size(); ++length) {
    // The memory ends with the NUL: a reader beyond it is found.
    std::vector<char> exact(text.begin(), text.begin() + static_cast<std::ptrdiff_t>(length));
    exact.push_back('\0');
    double pairs[4][2];
    const char* behind = nullptr;
    int32_t lineFeeds = 0;
    const int64_t count =
        HostNumberScanPairs(exact.data(), exact.data() + length, pairs, 4, &behind, &lineFeeds);
    EXPECT_EQ(count, length >= 4 ? 1 : 0) << length;
    EXPECT_LE(behind, exact.data() + length);
  }
}

TEST_F(HostNumberPairsTest, TheValuesAreThoseOfTheScanner) {
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
    const std::string first = number();
    const std::string second = number();
    const Pairs pairs = Scan(first + " " + second + ";");
    ASSERT_EQ(pairs.values.size(), 1u) << first << " " << second;
    double expected[2] = {};
    ASSERT_EQ(HostNumberScan(first.data(), static_cast<int64_t>(first.size()), &expected[0]), HOST_ERR_NONE);
    ASSERT_EQ(HostNumberScan(second.data(), static_cast<int64_t>(second.size()), &expected[1]),
              HOST_ERR_NONE);
    ASSERT_EQ(std::memcmp(pairs.values[0].data(), expected, sizeof expected), 0) << first << " " << second;
  }
}

TEST_F(HostNumberPairsTest, EveryNumberCountsAsOneScanInARehearsal) {
  HostBeginRehearsal();
  Scan("1 2 3 4;");
  EXPECT_EQ(HostUtilityCallCount(HOST_UTILITY_NumberScan), 4);
}

TEST_F(HostNumberPairsTest, NothingIsReadWhereARehearsalPlansAFailure) {
  WithFailure({HOST_UTILITY_NumberScan, 3, 4711, HOST_THROW_NOTHING}, [&] {
    const Pairs pairs = Scan("1 2 3 4;");
    EXPECT_TRUE(pairs.values.empty());
    EXPECT_EQ(pairs.taken, 0);
    EXPECT_EQ(HostUtilityCallCount(HOST_UTILITY_NumberScan), 0);
  });
}

}  // namespace
}  // namespace hostutil_tests
