#include <gtest/gtest.h>

#include <cstdint>
#include <string>
#include <vector>

#include "UtilityTest.h"
#include "hostutil/HostSetup.h"

namespace hostutil_tests {
namespace {

using Units = std::vector<HostUTF16Unit>;

Units PathUnits(const std::string& path) {
  const std::int64_t length = HostPathToUnits(path.c_str(), nullptr, 0);
  Units units(static_cast<std::size_t>(length) + 1, 0x7777);
  EXPECT_EQ(HostPathToUnits(path.c_str(), units.data(), length + 1), length);
  EXPECT_EQ(units.back(), 0);
  units.pop_back();
  return units;
}

std::string ShownUnits(Units units) {
  units.push_back(0);
  const std::int64_t length = HostUnitsToShownText(units.data(), nullptr, 0);
  std::string text(static_cast<std::size_t>(length) + 1, '?');
  EXPECT_EQ(HostUnitsToShownText(units.data(), text.data(), length + 1), length);
  text.pop_back();
  return text;
}

struct Case {
  const char* bytes;
  Units units;
  const char* shown;
};

const char* const kReplaced = "\xEF\xBF\xBD";

TEST(PathsTest, BytesBecomeUnitsAndUndecodableOnesLoneSurrogates) {
  const Case cases[] = {
      {"", {}, ""},
      {"shot.ma", {'s', 'h', 'o', 't', '.', 'm', 'a'}, "shot.ma"},
      {"\x7F", {0x7F}, "\x7F"},
      {"\xC2\x80", {0x80}, "\xC2\x80"},
      {"\xC3\xA9", {0xE9}, "\xC3\xA9"},
      {"\xDF\xBF", {0x7FF}, "\xDF\xBF"},
      {"\xE0\xA0\x80", {0x800}, "\xE0\xA0\x80"},
      {"\xED\x9F\xBF", {0xD7FF}, "\xED\x9F\xBF"},
      {"\xEE\x80\x80", {0xE000}, "\xEE\x80\x80"},
      {"\xEF\xBF\xBF", {0xFFFF}, "\xEF\xBF\xBF"},
      {"\xF0\x90\x80\x80", {0xD800, 0xDC00}, "\xF0\x90\x80\x80"},
      {"\xF0\x9F\x8E\xAC", {0xD83C, 0xDFAC}, "\xF0\x9F\x8E\xAC"},
      {"\xF4\x8F\xBF\xBF", {0xDBFF, 0xDFFF}, "\xF4\x8F\xBF\xBF"},
      {"\x80", {0xDC80}, kReplaced},
      {"\xFF", {0xDCFF}, kReplaced},
      {"a\xE9z", {'a', 0xDCE9, 'z'}, "a\xEF\xBF\xBDz"},
  };
  for (const Case& one : cases) {
    EXPECT_EQ(PathUnits(one.bytes), one.units) << one.shown;
    EXPECT_EQ(ShownUnits(one.units), one.shown);
  }
}

// Lead bytes F0 to F4, each bit of which counts.
TEST(PathsTest, EveryLeadByteOfFourBytesIsRead) {
  EXPECT_EQ(PathUnits("\xF0\x90\x80\x80"), (Units{0xD800, 0xDC00}));
  EXPECT_EQ(PathUnits("\xF1\x80\x80\x80"), (Units{0xD8C0, 0xDC00}));
  EXPECT_EQ(PathUnits("\xF2\x80\x80\x80"), (Units{0xD9C0, 0xDC00}));
  EXPECT_EQ(PathUnits("\xF3\x80\x80\x80"), (Units{0xDAC0, 0xDC00}));
  EXPECT_EQ(PathUnits("\xF4\x80\x80\x80"), (Units{0xDBC0, 0xDC00}));
}

TEST(PathsTest, WhatUTF8ForbidsIsKeptByteForByte) {
  const struct {
    const char* why;
    const char* bytes;
    Units units;
  } cases[] = {
      {"overlong, two bytes", "\xC1\xBF", {0xDCC1, 0xDCBF}},
      {"overlong, three bytes", "\xE0\x9F\xBF", {0xDCE0, 0xDC9F, 0xDCBF}},
      {"overlong, four bytes", "\xF0\x8F\xBF\xBF", {0xDCF0, 0xDC8F, 0xDCBF, 0xDCBF}},
      {"a surrogate", "\xED\xA0\x80", {0xDCED, 0xDCA0, 0xDC80}},
      {"the last surrogate", "\xED\xBF\xBF", {0xDCED, 0xDCBF, 0xDCBF}},
      {"beyond the last code point", "\xF4\x90\x80\x80", {0xDCF4, 0xDC90, 0xDC80, 0xDC80}},
      {"a lead byte of five", "\xF8\x88\x80\x80\x80", {0xDCF8, 0xDC88, 0xDC80, 0xDC80, 0xDC80}},
      {"cut after one of two", "\xC3", {0xDCC3}},
      {"cut after two of three", "\xE2\x82", {0xDCE2, 0xDC82}},
      {"cut after three of four", "\xF0\x9F\x8E", {0xDCF0, 0xDC9F, 0xDC8E}},
      {"cut short by a letter", "\xE2\x82z", {0xDCE2, 0xDC82, 'z'}},
      {"cut short by a whole character", "\xE2\xC3\xA9", {0xDCE2, 0xE9}},
  };
  for (const auto& one : cases) EXPECT_EQ(PathUnits(one.bytes), one.units) << one.why;
}

TEST(PathsTest, EveryLoneSurrogateIsShownAsTheReplacementCharacter) {
  for (unsigned unit = 0xD800; unit <= 0xDFFF; ++unit) {
    ASSERT_EQ(ShownUnits({static_cast<HostUTF16Unit>(unit)}), kReplaced) << unit;
  }
  EXPECT_EQ(ShownUnits({0xD83C, 'x'}), std::string(kReplaced) + "x");
  EXPECT_EQ(ShownUnits({0xDFAC, 0xD83C}), std::string(kReplaced) + kReplaced);
  EXPECT_EQ(ShownUnits({0xDC00, 0xDC01}), std::string(kReplaced) + kReplaced);
}

TEST(PathsTest, AHighSurrogateBeforeWhatIsNoLowOneStaysAlone) {
  EXPECT_EQ(ShownUnits({0xD800, 'a'}), std::string(kReplaced) + "a");
  EXPECT_EQ(ShownUnits({0xD800, 0xD800}), std::string(kReplaced) + kReplaced);
  EXPECT_EQ(ShownUnits({0xDBFF, 0xE000}), std::string(kReplaced) + "\xEE\x80\x80");
  EXPECT_EQ(ShownUnits({0xD800}), kReplaced);
}

TEST(PathsTest, ASmallCapacityTakesWholeCharactersAndTheirNul) {
  const char* path =
      "a\xF0\x9F\x8E\xAC"
      "b";  // 1 + 2 + 1 units, 1 + 4 + 1 bytes
  const Units whole = {'a', 0xD83C, 0xDFAC, 'b', 0};
  const std::size_t wholeCharactersAt[] = {0, 0, 1, 1, 3, 4, 4};  // units written at each capacity
  for (std::size_t capacity = 0; capacity <= 6; ++capacity) {
    Units units(8, 0x7777);
    EXPECT_EQ(HostPathToUnits(path, units.data(), static_cast<std::int64_t>(capacity)), 4);
    const std::size_t written = wholeCharactersAt[capacity];
    for (std::size_t i = 0; i < written; ++i) EXPECT_EQ(units[i], whole[i]);
    if (capacity > 0) {
      EXPECT_EQ(units[written], 0) << capacity;
    }
    for (std::size_t i = capacity; i < units.size(); ++i) EXPECT_EQ(units[i], 0x7777) << capacity;
  }
  const std::size_t bytesAt[] = {0, 0, 1, 1, 1, 1, 5, 6};
  for (std::size_t capacity = 0; capacity <= 7; ++capacity) {
    std::string text(9, '?');
    EXPECT_EQ(HostUnitsToShownText(whole.data(), text.data(), static_cast<std::int64_t>(capacity)), 6);
    EXPECT_EQ(text.substr(0, bytesAt[capacity]), std::string(path).substr(0, bytesAt[capacity]));
    if (capacity > 0) {
      EXPECT_EQ(text[bytesAt[capacity]], '\0') << capacity;
    }
    EXPECT_EQ(text.substr(capacity), std::string(9 - capacity, '?')) << capacity;
  }
}

TEST(PathsTest, NullCountsAsTheEmptyText) {
  HostUTF16Unit unit = 7;
  EXPECT_EQ(HostPathToUnits(nullptr, &unit, 1), 0);
  EXPECT_EQ(unit, 0);
  char byte = 'x';
  EXPECT_EQ(HostUnitsToShownText(nullptr, &byte, 1), 0);
  EXPECT_EQ(byte, '\0');
  EXPECT_EQ(HostPathToUnits("ab", nullptr, 100), 2);
}

}  // namespace
}  // namespace hostutil_tests
