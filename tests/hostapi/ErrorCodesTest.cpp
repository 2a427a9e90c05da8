#include "hostapi/ErrorCodes.h"

#include <gtest/gtest.h>

#include <cctype>
#include <cstdint>
#include <map>
#include <set>
#include <string>

namespace {

struct Entry {
  const char* name;
  std::int32_t number;
  const char* sentence;
};

constexpr Entry kEntries[] = {
#define ENTRY(name, number, sentence) {#name, number, sentence},
    HOST_ERROR_TABLE(ENTRY)
#undef ENTRY
};

TEST(ErrorCodesTest, NamesAreUnique) {
  std::set<std::string> names;
  for (const Entry& entry : kEntries) EXPECT_TRUE(names.insert(entry.name).second) << entry.name;
}

TEST(ErrorCodesTest, NumbersAreUniqueAndNoneIsSuccess) {
  std::map<std::int32_t, std::string> numbers = {{0, "success"}};
  for (const Entry& entry : kEntries) {
    const auto [place, added] = numbers.emplace(entry.number, entry.name);
    EXPECT_TRUE(added) << entry.name << " and " << place->second;
    EXPECT_GT(entry.number, 0) << entry.name;
  }
}

TEST(ErrorCodesTest, NamesAreUpperCaseWords) {
  for (const Entry& entry : kEntries) {
    for (const char* at = entry.name; *at != '\0'; ++at) {
      EXPECT_TRUE((*at >= 'A' && *at <= 'Z') || *at == '_') << entry.name;
    }
  }
}

TEST(ErrorCodesTest, SentencesAreUniquePlainAndFitAfterAColon) {
  std::set<std::string> sentences;
  for (const Entry& entry : kEntries) {
    const std::string sentence = entry.sentence;
    EXPECT_TRUE(sentences.insert(sentence).second) << entry.name;
    ASSERT_GE(sentence.size(), 15u) << entry.name;
    EXPECT_TRUE(std::islower(static_cast<unsigned char>(sentence.front()))) << sentence;
    EXPECT_NE(sentence.back(), '.') << sentence;
    EXPECT_NE(sentence.find(' '), std::string::npos) << sentence;
    for (const char c : sentence) EXPECT_TRUE(c >= ' ' && c < '\x7F') << sentence;
  }
}

// Scripts and bug reports hold these numbers: a change here breaks them.
TEST(ErrorCodesTest, TheNumbersAreFixed) {
  const std::map<std::string, std::int32_t> fixed = {{"NULL_ARGUMENT", 3},
                                                     {"MISSING_SUITE", 13},
                                                     {"MAYA_SYNTAX", 1289985},
                                                     {"MAYA_UNEXPECTED_END", 1289986},
                                                     {"MAYA_KEY_COUNTS", 1289987},
                                                     {"NUMBER_SYNTAX", 2001},
                                                     {"NUMBER_RANGE", 2002},
                                                     {"LIST_MEMORY", 2011},
                                                     {"LIST_INDEX", 2012},
                                                     {"LIST_LOCKED", 2013},
                                                     {"FILE_OPEN", 2021},
                                                     {"FILE_SHORT_READ", 2022},
                                                     {"FILE_SIZE", 2023},
                                                     {"FILE_CLOSE", 2024},
                                                     {"FILE_STATE", 2025},
                                                     {"MATRIX_NOT_FINITE", 2031},
                                                     {"TEXT_TOO_LONG", 2041},
                                                     {"TEXT_MEMORY", 2042},
                                                     {"STRING_TABLE", 2043},
                                                     {"EXCEPTION_MEMORY", 2051},
                                                     {"EXCEPTION_OTHER", 2052},
                                                     {"UTILITY_NULL", 2061},
                                                     {"BAD_HANDLE", 3001},
                                                     {"BAD_POINTER", 3002},
                                                     {"BAD_PLUGIN_ID", 3003},
                                                     {"BAD_SIZE", 3011},
                                                     {"BAD_RATIO", 3012},
                                                     {"BAD_TIME", 3013},
                                                     {"BAD_VALUE", 3014},
                                                     {"BAD_FILM_SIZE", 3015},
                                                     {"BAD_DIRECTION", 3016},
                                                     {"NOT_A_FOLDER", 3021},
                                                     {"NOT_A_COMP", 3022},
                                                     {"NOT_A_CAMERA", 3023},
                                                     {"NO_SUCH_STREAM", 3024},
                                                     {"WRONG_COMP", 3025},
                                                     {"PARENT_CIRCLE", 3026},
                                                     {"BATCH_OPEN", 3027},
                                                     {"BATCH_KEY", 3028},
                                                     {"BAD_TIME_MODE", 3029},
                                                     {"MEMORY", 3031},
                                                     {"MEMORY_STATE", 3032},
                                                     {"BAD_MEMORY_SIZE", 3033},
                                                     {"TOO_MANY_LAYERS", 3034},
                                                     {"TOO_MANY_KEYS", 3035},
                                                     {"TOO_MUCH_MEMORY", 3036},
                                                     {"SILENT_ERRORS", 3041},
                                                     {"REGISTRATION", 3051},
                                                     {"SUITE_REFUSED", 3061},
                                                     {"SUITE_NOT_HELD", 3062}};
  std::map<std::string, std::int32_t> actual;
  for (const Entry& entry : kEntries) actual[entry.name] = entry.number;
  EXPECT_EQ(actual, fixed);
}

TEST(ErrorCodesTest, ANameIsAnEnumerator) {
  EXPECT_EQ(HOST_ERR_NONE, 0);
  EXPECT_EQ(HOST_ERR_MISSING_SUITE, 13);
  EXPECT_EQ(HOST_ERR_MAYA_KEY_COUNTS, 1289987);
}

}  // namespace
