#include "hostutil/UTF16String.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <string>
#include <vector>

#include "UtilityTest.h"

namespace hostutil_tests {
namespace {

using Units = std::vector<HostUTF16Unit>;

class UTF16StringTest : public UtilityTest {};

std::string Stripped(const std::string& name, std::int32_t flag) {
  UTF16String* text = MakeText(name);
  UTF16String* stripped = nullptr;
  EXPECT_EQ(HostStripExtension(text, flag, &stripped), HOST_ERR_NONE);
  EXPECT_NE(stripped, text) << "a new text";
  UTF16StringRelease(text);
  return ShownAndReleased(stripped);
}

std::string Formatted(const char* pattern, const char* argument1, const char* argument2) {
  UTF16String* first = MakeText(argument1);
  UTF16String* second = MakeText(argument2);
  UTF16String* text = nullptr;
  EXPECT_EQ(UTF16StringFormat(pattern, first, second, &text), HOST_ERR_NONE);
  UTF16StringRelease(first);
  UTF16StringRelease(second);
  return ShownAndReleased(text);
}

TEST_F(UTF16StringTest, UnitsAreCopiedAndTerminated) {
  HostUTF16Unit units[] = {'s', 0xE9, 0xD83C, 0xDFAC, 0xDC80, 0};
  UTF16String* text = nullptr;
  ASSERT_EQ(UTF16StringMakeFromUnits(units, &text), HOST_ERR_NONE);
  units[0] = 'X';
  EXPECT_EQ(UnitsOf(text), (Units{'s', 0xE9, 0xD83C, 0xDFAC, 0xDC80}));
  EXPECT_EQ(UTF16StringLength(text), 5);
  EXPECT_EQ(UTF16StringUnits(text)[5], 0);
  UTF16StringRelease(text);
}

TEST_F(UTF16StringTest, BytesAreDecodedAndUndecodableOnesKeptAsLoneSurrogates) {
  UTF16String* text = MakeText("\xC3\xA9\xF0\x9F\x8E\xAC\xFF");
  EXPECT_EQ(UnitsOf(text), (Units{0xE9, 0xD83C, 0xDFAC, 0xDCFF}));
  UTF16StringRelease(text);
}

TEST_F(UTF16StringTest, TheEmptyTextHasNoUnitsButTheNul) {
  UTF16String* text = MakeText("");
  EXPECT_EQ(UTF16StringLength(text), 0);
  EXPECT_EQ(UTF16StringUnits(text)[0], 0);
  UTF16StringRelease(text);
}

TEST_F(UTF16StringTest, UnitsEndAtTheirFirstNul) {
  const HostUTF16Unit units[] = {0, 'x', 0};
  for (const std::size_t from : {0u, 1u}) {
    UTF16String* text = nullptr;
    ASSERT_EQ(UTF16StringMakeFromUnits(units + from, &text), HOST_ERR_NONE);
    EXPECT_EQ(UnitsOf(text), from == 0 ? Units{} : Units{'x'});
    UTF16StringRelease(text);
  }
}

TEST_F(UTF16StringTest, ANullTextReadsAsTheEmptyOne) {
  EXPECT_EQ(UTF16StringLength(nullptr), 0);
  ASSERT_NE(UTF16StringUnits(nullptr), nullptr);
  EXPECT_EQ(UTF16StringUnits(nullptr)[0], 0);
  UTF16StringRetain(nullptr);
  UTF16StringRelease(nullptr);
}

TEST_F(UTF16StringTest, ATextLivesUntilItsLastReferenceIsGivenBack) {
  UTF16String* text = MakeText("camera");
  const HostUTF16Unit* units = UTF16StringUnits(text);
  UTF16StringRetain(text);
  UTF16StringRelease(text);
  EXPECT_EQ(UTF16StringUnits(text), units);
  EXPECT_EQ(Shown(text), "camera");
  UTF16StringRelease(text);
}

TEST_F(UTF16StringTest, NullPointersAreRefusedAndNullIsHandedOut) {
  const HostUTF16Unit units[] = {'a', 0};
  EXPECT_EQ(UTF16StringMakeFromUnits(units, nullptr), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(UTF16StringMakeFromBytes("a", nullptr), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(UTF16StringFormat("a", nullptr, nullptr, nullptr), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(HostStripExtension(nullptr, 1, nullptr), HOST_ERR_UTILITY_NULL);
  auto* const untouched = reinterpret_cast<UTF16String*>(1);
  UTF16String* text = untouched;
  EXPECT_EQ(UTF16StringMakeFromUnits(nullptr, &text), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(text, nullptr);
  text = untouched;
  EXPECT_EQ(UTF16StringMakeFromBytes(nullptr, &text), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(text, nullptr);
  text = untouched;
  EXPECT_EQ(UTF16StringFormat(nullptr, nullptr, nullptr, &text), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(text, nullptr);
}

TEST_F(UTF16StringTest, TheLastDotAndWhatFollowsItAreRemoved) {
  EXPECT_EQ(Stripped("scene.ma", 1), "scene");
  EXPECT_EQ(Stripped(".ma", 1), "");
  EXPECT_EQ(Stripped("shot.v01.ma", 1), "shot.v01");
  EXPECT_EQ(Stripped("scene", 1), "scene");
  EXPECT_EQ(Stripped("scene.", 1), "scene");
  EXPECT_EQ(Stripped("", 1), "");
  EXPECT_EQ(Stripped("a..", 1), "a.");
}

TEST_F(UTF16StringTest, AnyFlagButZeroRemovesTheExtension) {
  EXPECT_EQ(Stripped("scene.ma", 0), "scene.ma");
  EXPECT_EQ(Stripped("scene.ma", -1), "scene");
}

TEST_F(UTF16StringTest, StrippingANullTextGivesTheEmptyOne) {
  UTF16String* stripped = nullptr;
  ASSERT_EQ(HostStripExtension(nullptr, 1, &stripped), HOST_ERR_NONE);
  ASSERT_NE(stripped, nullptr);
  EXPECT_EQ(ShownAndReleased(stripped), "");
}

TEST_F(UTF16StringTest, MarkersAreReplacedByTheArgumentOfTheirNumber) {
  EXPECT_EQ(Formatted("^^1 ^^2", "Square", "shot01"), "Square shot01");
  EXPECT_EQ(Formatted("^^2-^^1-^^2", "one", "two"), "two-one-two");
  EXPECT_EQ(Formatted("no marker", "one", "two"), "no marker");
  EXPECT_EQ(Formatted("", "one", "two"), "");
}

TEST_F(UTF16StringTest, MarkersInsideArgumentsAreNotExpanded) {
  EXPECT_EQ(Formatted("^^1 ^^2", "^^2", "^^1"), "^^2 ^^1");
  EXPECT_EQ(Formatted("^^12", "^", "x"), "^2");
  EXPECT_EQ(Formatted("^^^1", "a", "b"), "^a");
}

TEST_F(UTF16StringTest, WhatOnlyLooksLikeAMarkerIsCopied) {
  EXPECT_EQ(Formatted("^^0 ^^3 ^1 ^ ^^", "a", "b"), "^^0 ^^3 ^1 ^ ^^");
}

TEST_F(UTF16StringTest, APatternIsDecodedLikeAnyBytes) {
  EXPECT_EQ(Formatted("\xE6\x96\xB9 ^^2", "a", "\xC3\xA9"), "\xE6\x96\xB9 \xC3\xA9");
}

TEST_F(UTF16StringTest, LoneSurrogatesPassThroughFormattingAndStripping) {
  UTF16String* name = MakeText("sh\xFFot.ma");
  UTF16String* stripped = nullptr;
  ASSERT_EQ(HostStripExtension(name, 1, &stripped), HOST_ERR_NONE);
  UTF16String* formatted = nullptr;
  ASSERT_EQ(UTF16StringFormat("^^1", stripped, nullptr, &formatted), HOST_ERR_NONE);
  EXPECT_EQ(UnitsOf(formatted), (Units{'s', 'h', 0xDCFF, 'o', 't'}));
  UTF16StringRelease(name);
  UTF16StringRelease(stripped);
  UTF16StringRelease(formatted);
}

TEST_F(UTF16StringTest, ANullArgumentCountsAsTheEmptyText) {
  UTF16String* text = nullptr;
  ASSERT_EQ(UTF16StringFormat("[^^1^^2]", nullptr, nullptr, &text), HOST_ERR_NONE);
  EXPECT_EQ(ShownAndReleased(text), "[]");
}

}  // namespace
}  // namespace hostutil_tests
