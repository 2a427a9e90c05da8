#include "hostutil/HostStrings.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <string>

#include "UtilityTest.h"

namespace hostutil_tests {
namespace {

constexpr std::int64_t kBuffer = 1024;

class HostStringsTest : public UtilityTest {
 protected:
  void TearDown() override {
    EXPECT_EQ(HostUnregisterStringTable(table_), HOST_ERR_NONE);
    UtilityTest::TearDown();
  }

  void Register() {
    const char* const entries[] = {"key/0=Scene", "key/1=", "key/2=a=b", "=no key"};
    ASSERT_EQ(HostRegisterStringTable("Table", entries, 4, &table_), HOST_ERR_NONE);
    ASSERT_NE(table_, nullptr);
  }

  HostStringTable* table_ = nullptr;
};

TEST_F(HostStringsTest, AnEntryIsLookedUpByNumberAndGivesWhatFollowsItsFirstEqualsSign) {
  Register();
  EXPECT_STREQ(HostLocalizedString(table_, 0), "Scene");
  EXPECT_STREQ(HostLocalizedString(table_, 1), "");
  EXPECT_STREQ(HostLocalizedString(table_, 2), "a=b");
  EXPECT_STREQ(HostLocalizedString(table_, 3), "no key");
}

TEST_F(HostStringsTest, WhereThereIsNoEntryTheTextIsEmpty) {
  Register();
  EXPECT_STREQ(HostLocalizedString(table_, 4), "");
  EXPECT_STREQ(HostLocalizedString(table_, -1), "");
  EXPECT_STREQ(HostLocalizedString(table_, INT32_MAX), "");
  EXPECT_STREQ(HostLocalizedString(nullptr, 0), "");
}

TEST_F(HostStringsTest, TheTextOfAnUnregisteredTableIsEmpty) {
  Register();
  HostStringTable* const ended = table_;
  ASSERT_EQ(HostUnregisterStringTable(table_), HOST_ERR_NONE);
  table_ = nullptr;
  EXPECT_STREQ(HostLocalizedString(ended, 0), "");
  EXPECT_EQ(HostUnregisterStringTable(ended), HOST_ERR_UTILITY_NULL);
}

TEST_F(HostStringsTest, TheEntriesAreCopied) {
  std::string entry = "key=text";
  const char* const entries[] = {entry.c_str()};
  ASSERT_EQ(HostRegisterStringTable("Table", entries, 1, &table_), HOST_ERR_NONE);
  entry = "xxxxxxxx";
  EXPECT_STREQ(HostLocalizedString(table_, 0), "text");
}

TEST_F(HostStringsTest, ATranslationSetAfterRegistrationShows) {
  Register();
  ASSERT_EQ(HostSetTranslation("key/0", "Szene"), HOST_ERR_NONE);
  EXPECT_STREQ(HostLocalizedString(table_, 0), "Szene");
  EXPECT_STREQ(HostLocalizedString(table_, 2), "a=b");
}

TEST_F(HostStringsTest, ATranslationSetBeforeRegistrationShows) {
  std::string key = "key/2";
  std::string text = "Szene 2";
  ASSERT_EQ(HostSetTranslation(key.c_str(), text.c_str()), HOST_ERR_NONE);
  key = text = "changed";
  Register();
  EXPECT_STREQ(HostLocalizedString(table_, 2), "Szene 2");
}

TEST_F(HostStringsTest, TheLastTranslationOfAKeyCountsAndClearingGivesTheDefaultBack) {
  Register();
  ASSERT_EQ(HostSetTranslation("key/0", "Szene"), HOST_ERR_NONE);
  ASSERT_EQ(HostSetTranslation("key/0", "Sc\xC3\xA8ne"), HOST_ERR_NONE);
  EXPECT_STREQ(HostLocalizedString(table_, 0), "Sc\xC3\xA8ne");
  HostClearTranslations();
  EXPECT_STREQ(HostLocalizedString(table_, 0), "Scene");
}

TEST_F(HostStringsTest, ATranslationToTheEmptyTextIsATranslation) {
  Register();
  ASSERT_EQ(HostSetTranslation("key/0", ""), HOST_ERR_NONE);
  EXPECT_STREQ(HostLocalizedString(table_, 0), "");
}

TEST_F(HostStringsTest, KeysAreComparedWholeAndWithTheirCase) {
  Register();
  ASSERT_EQ(HostSetTranslation("KEY/0", "x"), HOST_ERR_NONE);
  ASSERT_EQ(HostSetTranslation("key/", "y"), HOST_ERR_NONE);
  EXPECT_STREQ(HostLocalizedString(table_, 0), "Scene");
}

TEST_F(HostStringsTest, TranslationsWantAKeyAndAText) {
  EXPECT_EQ(HostSetTranslation(nullptr, "x"), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(HostSetTranslation("x", nullptr), HOST_ERR_UTILITY_NULL);
}

TEST_F(HostStringsTest, AnEntryWithoutAnEqualsSignIsRefused) {
  const char* const entries[] = {"key=text", "no sign"};
  EXPECT_EQ(HostRegisterStringTable("Table", entries, 2, &table_), HOST_ERR_STRING_TABLE);
  EXPECT_EQ(table_, nullptr);
  EXPECT_EQ(HostRegisterStringTable("Table", entries, 1, &table_), HOST_ERR_NONE) << "the name is still free";
}

TEST_F(HostStringsTest, ANullEntryIsRefused) {
  const char* const entries[] = {nullptr};
  EXPECT_EQ(HostRegisterStringTable("Table", entries, 1, &table_), HOST_ERR_STRING_TABLE);
}

TEST_F(HostStringsTest, ANameThatIsRegisteredIsRefusedUntilItsTableEnds) {
  Register();
  const char* const entries[] = {"key=text"};
  auto* second = reinterpret_cast<HostStringTable*>(1);
  EXPECT_EQ(HostRegisterStringTable("Table", entries, 1, &second), HOST_ERR_STRING_TABLE);
  EXPECT_EQ(second, nullptr);
  EXPECT_EQ(HostRegisterStringTable("table", entries, 1, &second), HOST_ERR_NONE) << "another name";
  EXPECT_STREQ(HostLocalizedString(second, 0), "text");
  EXPECT_STREQ(HostLocalizedString(table_, 0), "Scene");
  EXPECT_EQ(HostUnregisterStringTable(second), HOST_ERR_NONE);
  EXPECT_EQ(HostUnregisterStringTable(table_), HOST_ERR_NONE);
  EXPECT_EQ(HostRegisterStringTable("Table", entries, 1, &table_), HOST_ERR_NONE);
}

TEST_F(HostStringsTest, CountsAndPointersAreChecked) {
  const char* const entries[] = {"key=text"};
  EXPECT_EQ(HostRegisterStringTable("Table", entries, -1, &table_), HOST_ERR_STRING_TABLE);
  EXPECT_EQ(HostRegisterStringTable(nullptr, entries, 1, &table_), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(HostRegisterStringTable("Table", nullptr, 1, &table_), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(HostRegisterStringTable("Table", entries, 1, nullptr), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(HostRegisterStringTable("Table", nullptr, 0, &table_), HOST_ERR_NONE) << "an empty table";
}

TEST_F(HostStringsTest, UnregisteringNullDoesNothing) {
  EXPECT_EQ(HostUnregisterStringTable(nullptr), HOST_ERR_NONE);
}

TEST_F(HostStringsTest, TablesStayWhenLeftoversAreReleased) {
  Register();
  HostReleaseLeftovers();
  EXPECT_STREQ(HostLocalizedString(table_, 0), "Scene");
}

TEST(HostStringCopyTest, ATextOf1023BytesFitsABufferOf1024AndOneOf1024DoesNot) {
  std::string buffer(kBuffer + 1, '?');
  const std::string fits(1023, 'a');
  EXPECT_EQ(HostStringCopy(buffer.data(), kBuffer, fits.c_str()), HOST_ERR_NONE);
  EXPECT_STREQ(buffer.c_str(), fits.c_str());
  EXPECT_EQ(buffer[kBuffer], '?');
  const std::string tooLong(1024, 'b');
  EXPECT_EQ(HostStringCopy(buffer.data(), kBuffer, tooLong.c_str()), HOST_ERR_TEXT_TOO_LONG);
  EXPECT_STREQ(buffer.c_str(), "");
  EXPECT_EQ(buffer[kBuffer], '?');
}

TEST(HostStringCopyTest, ABufferOfOneByteHoldsTheEmptyTextAndOneOfNoneHoldsNothing) {
  char buffer[] = "?";
  EXPECT_EQ(HostStringCopy(buffer, 1, ""), HOST_ERR_NONE);
  EXPECT_EQ(buffer[0], '\0');
  EXPECT_EQ(HostStringCopy(buffer, 1, "a"), HOST_ERR_TEXT_TOO_LONG);
  buffer[0] = '?';
  EXPECT_EQ(HostStringCopy(buffer, 0, ""), HOST_ERR_TEXT_TOO_LONG);
  EXPECT_EQ(HostStringCopy(buffer, -5, ""), HOST_ERR_TEXT_TOO_LONG);
  EXPECT_EQ(HostStringFormat(buffer, 0, "", "", ""), HOST_ERR_TEXT_TOO_LONG);
  EXPECT_EQ(buffer[0], '?');
}

TEST(HostStringCopyTest, NullPointersAreRefused) {
  char buffer[] = "?";
  EXPECT_EQ(HostStringCopy(nullptr, 1, ""), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(HostStringCopy(buffer, 1, nullptr), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(HostStringFormat(nullptr, 1, "", "", ""), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(HostStringFormat(buffer, 1, nullptr, "", ""), HOST_ERR_UTILITY_NULL);
}

std::string Formatted(const char* pattern, const char* argument1, const char* argument2) {
  char buffer[kBuffer];
  EXPECT_EQ(HostStringFormat(buffer, kBuffer, pattern, argument1, argument2), HOST_ERR_NONE);
  return buffer;
}

TEST(HostStringFormatTest, MarkersAreReplacedByTheArgumentOfTheirNumber) {
  EXPECT_EQ(Formatted("^^1: ^^2", "shot.ma", "Error reading"), "shot.ma: Error reading");
  EXPECT_EQ(Formatted("^^2^^2^^1", "a", "b"), "bba");
  EXPECT_EQ(Formatted("^^1", "\xC3\xA9", ""), "\xC3\xA9");
}

TEST(HostStringFormatTest, MarkersInsideArgumentsAreNotExpanded) {
  EXPECT_EQ(Formatted("^^1 ^^2", "^^2^^1", "^^1"), "^^2^^1 ^^1");
  EXPECT_EQ(Formatted("^^12", "^", "x"), "^2");
  EXPECT_EQ(Formatted("^^1^1", "^", "x"), "^^1");
}

TEST(HostStringFormatTest, WhatOnlyLooksLikeAMarkerIsCopied) {
  EXPECT_EQ(Formatted("^^^1 ^^0 ^^3 ^1 ^^", "a", "b"), "^a ^^0 ^^3 ^1 ^^");
}

TEST(HostStringFormatTest, ANullArgumentCountsAsTheEmptyText) {
  EXPECT_EQ(Formatted("<^^1|^^2>", nullptr, nullptr), "<|>");
}

TEST(HostStringFormatTest, EveryLengthUpToTheBufferFitsAndNoLongerOne) {
  const std::string argument(10, 'x');
  const std::string whole = "abc" + argument + "def" + argument;
  for (std::int64_t capacity = 1; capacity <= 40; ++capacity) {
    std::string buffer(41, '?');
    const HostError code =
        HostStringFormat(buffer.data(), capacity, "abc^^1def^^2", argument.c_str(), argument.c_str());
    const bool fits = static_cast<std::size_t>(capacity) > whole.size();
    EXPECT_EQ(code, fits ? HOST_ERR_NONE : HOST_ERR_TEXT_TOO_LONG) << capacity;
    EXPECT_EQ(std::string(buffer.c_str()), fits ? whole : "") << capacity;
    EXPECT_EQ(buffer.substr(static_cast<std::size_t>(capacity)),
              std::string(41 - static_cast<std::size_t>(capacity), '?'));
  }
}

TEST(HostStringFormatTest, AMessageOf1023BytesIsFormattedAndOneOf1024IsNot) {
  char buffer[kBuffer];
  const std::string context(1000, 'c');
  const std::string fits(1023 - 1000 - 2, 'd');
  EXPECT_EQ(HostStringFormat(buffer, kBuffer, "^^1: ^^2", context.c_str(), fits.c_str()), HOST_ERR_NONE);
  EXPECT_EQ(std::string(buffer), context + ": " + fits);
  EXPECT_EQ(HostStringFormat(buffer, kBuffer, "^^1: ^^2", context.c_str(), (fits + "d").c_str()),
            HOST_ERR_TEXT_TOO_LONG);
  EXPECT_STREQ(buffer, "");
}

}  // namespace
}  // namespace hostutil_tests
