// Every word that the second reader knows is in the generated scenes, and in the words of the fuzzer:
// otherwise nothing would compare how the two readers take it.
#include "tests/secondreader/KnownWords.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <fstream>
#include <sstream>
#include <string>
#include <vector>

#include "fuzz/SceneMutator.h"
#include "tests/secondreader/Lexer.h"
#include "tests/secondreader/SceneGenerator.h"

namespace secondreader {
namespace {

constexpr std::uint64_t kScenes = 2000;
constexpr int kEnough = 20;  // scenes that hold the word

bool isPartOfWord(char byte) {
  return (byte >= '0' && byte <= '9') || (lower(byte) >= 'a' && lower(byte) <= 'z');
}
bool endsWord(char byte) { return !isPartOfWord(byte); }
bool isBlank(char byte) { return byte == ' ' || byte == '\t' || byte == '\n' || byte == ':'; }
bool isQuote(char byte) { return byte == '"'; }
bool isBlankOrQuote(char byte) { return isBlank(byte) || isQuote(byte); }
bool isInQuotes(char byte) { return byte != '"'; }

// A known word in lower case, with what may stand before it.
struct SoughtWord {
  std::string word;
  bool (*mayStandBefore)(char byte);
  int scenes = 0;
};

std::string lowered(std::string_view text) {
  std::string result(text);
  for (char& letter : result) letter = lower(letter);
  return result;
}

std::vector<SoughtWord> soughtWords() {
  std::vector<SoughtWord> words;
  for (const Keyword& keyword : kKeywords) words.push_back({lowered(keyword.word), isBlank});
  for (const KnownWord& known : kBareWords) words.push_back({lowered(known.word), isBlank});
  for (const KnownWord& known : kAttributes) words.push_back({lowered(known.word), isQuote});
  for (const KnownWord& known : kPlugs) words.push_back({"." + lowered(known.word), isInQuotes});
  return words;
}

bool hasWhole(std::string_view text, std::string_view word, bool (*mayStandBefore)(char byte)) {
  for (std::size_t place = text.find(word, 1); place < text.size(); place = text.find(word, place + 1)) {
    const std::size_t end = place + word.size();
    if (mayStandBefore(text[place - 1]) && (end == text.size() || endsWord(text[end]))) return true;
  }
  return false;
}

TEST(KnownWordsTest, EachStandsInEnoughOfTheGeneratedScenes) {
  std::vector<SoughtWord> words = soughtWords();
  for (std::uint64_t seed = 0; seed < kScenes; ++seed) {
    const std::string scene = lowered(SceneGenerator(seed).make().bytes);
    for (SoughtWord& sought : words) {
      if (hasWhole(scene, sought.word, sought.mayStandBefore)) ++sought.scenes;
    }
  }
  for (const SoughtWord& sought : words) EXPECT_GE(sought.scenes, kEnough) << sought.word;
}

TEST(KnownWordsTest, EachIsWrittenByTheMutatorOfTheFuzzer) {
  constexpr int kChanges = 50'000;
  fuzz::Dice dice(1);
  std::string text;
  // What it begins with holds no known word. Some words come only in the place of another one, so it is
  // changed twice.
  for (int i = 0; i < kChanges; ++i) text += fuzz::MutateScene(fuzz::MutateScene("x \"y\";\n", dice), dice);
  text = lowered(text);
  for (const SoughtWord& sought : soughtWords()) {
    EXPECT_TRUE(hasWhole(text, sought.word, sought.mayStandBefore)) << sought.word;
  }
}

TEST(KnownWordsTest, EachIsInTheDictionaryOfTheFuzzer) {
  std::ostringstream read;
  read << std::ifstream(MAYASCENE_SOURCE_DIR "/fuzz/keywords.dict").rdbuf();
  const std::string text = lowered(read.str());
  for (const SoughtWord& sought : soughtWords()) {
    EXPECT_TRUE(hasWhole(text, sought.word, isBlankOrQuote)) << sought.word;
  }
}

}  // namespace
}  // namespace secondreader
