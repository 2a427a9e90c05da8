#include "bench/WordCount.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <random>
#include <sstream>
#include <string>
#include <string_view>

#include "tests/support/GuardedMemory.h"

namespace bench {
namespace {

// As the standard library cuts a text at white space.
std::size_t WordsOf(const std::string& text) {
  std::istringstream words(text);
  std::size_t count = 0;
  for (std::string word; words >> word;) ++count;
  return count;
}

void ExpectWords(std::string_view text, std::size_t expected) {
  for (const WordCounter& counter : wordCounters()) {
    EXPECT_EQ(counter.count(text.data(), text.size()), expected) << counter.name << ": " << text;
  }
  EXPECT_EQ(countWords(text.data(), text.size()), expected);
}

TEST(WordCountTest, AnEmptyTextHasNone) { ExpectWords("", 0); }

TEST(WordCountTest, WordsAreApartByAnyWhiteSpace) {
  ExpectWords("setAttr \".t\" 1\t2\n3\v4\f5\r6 ;", 9);
  ExpectWords("  \n\t ", 0);
}

TEST(WordCountTest, ControlCharactersAndBytesAbove127AreNoWhiteSpace) {
  using namespace std::string_view_literals;
  ExpectWords("a\0b a\x08z \x0e \x1f \x7f \x85 \xa0\xff"sv, 7);
}

TEST(WordCountTest, AWordOverTheEndOfABlockCountsOnce) {
  for (std::size_t before = 60; before <= 70; ++before) {
    ExpectWords(std::string(before, ' ') + "createNode", 1);
    ExpectWords(std::string(before, 'a') + " b", 2);
    ExpectWords(std::string(before, 'a') + "\n", 1);
  }
}

TEST(WordCountTest, EveryCounterAgreesWithTheLibrary) {
  std::mt19937 random(7);
  constexpr std::string_view kBytes = " \t\n\v\f\r\b\x0e\x80xyz;\"";
  for (std::size_t size = 0; size < 400; ++size) {
    std::string text(size, ' ');
    std::ranges::generate(text, [&] { return kBytes[random() % kBytes.size()]; });
    ExpectWords(text, WordsOf(text));
  }
}

TEST(WordCountTest, NothingIsReadBesideTheText) {
  testsupport::GuardedMemory memory;
  for (std::size_t size = 1; size < 200; ++size) {
    const std::string word(size, 'a');
    ExpectWords({memory.PutFirst(word) - size, size}, 1);
    ExpectWords({memory.Hold(word, 0), size}, 1);
  }
}

}  // namespace
}  // namespace bench
