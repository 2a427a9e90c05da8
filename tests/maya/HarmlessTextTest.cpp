// Passing over what the main loop ignores in bulk changes nothing of what the loop sees.
#include "maya/HarmlessText.h"

#include <random>

#include "tests/maya/LexFixture.h"
#include "tests/maya/RichScene.h"

namespace testsupport {
namespace {

class HarmlessTextTest : public ReaderTest {
 protected:
  struct Seen {
    Tokens acting;  // all but the tokens that a skipper may pass over
    HostError code = 0;
    std::int32_t line = 0;
    std::ptrdiff_t position = 0;
    bool operator==(const Seen&) const = default;
  };

  // What a loop that skips before every token sees; without a skipper, one that does not.
  Seen See(std::string_view text, SkipHarmlessText skip) {
    const GuardedText guarded(text);
    MAYA_Lex lex(host_.basicSuite(), guarded.begin(), guarded.end());
    Seen seen;
    try {
      for (MayaToken kind = Unknown; kind != EndOfFile;) {
        if (skip != nullptr) {
          lex.position = skip(lex.position, guarded.end(), &lex.line);
          lex.tokenStart = lex.position;
        }
        const char* start = nullptr;
        const char* last = nullptr;
        kind = lex.GetNextToken(&start, &last);
        if (!MayBePassedOver(kind, *start)) seen.acting.emplace_back(kind, std::string(start, last + 1));
      }
    } catch (int code) {
      seen.code = code;
    }
    seen.line = lex.line;
    seen.position = lex.position - guarded.begin();
    return seen;
  }

  static bool MayBePassedOver(MayaToken kind, char first) {
    const bool keywordStart = first == 'c' || first == 'C' || first == 's' || first == 'S';
    const bool word = kind == Identifier || (kind >= File && kind <= CurrentUnit);
    return kind == Semicolon || kind == Number || kind == Option || (word && !keywordStart);
  }

  void ExpectNoDifference(std::string_view text) {
    const Seen plain = See(text, nullptr);
    for (const HarmlessTextSkipper& skipper : HarmlessTextSkippers()) {
      const Seen skipped = See(text, skipper.skip);
      ASSERT_EQ(skipped.acting, plain.acting) << skipper.name << " over " << ::testing::PrintToString(text);
      ASSERT_EQ(skipped.code, plain.code) << skipper.name << " over " << ::testing::PrintToString(text);
      ASSERT_EQ(skipped.line, plain.line) << skipper.name << " over " << ::testing::PrintToString(text);
      ASSERT_EQ(skipped.position, plain.position)
          << skipper.name << " over " << ::testing::PrintToString(text);
    }
  }
};

TEST_F(HarmlessTextTest, ThereIsOneForEveryProcessor) {
  ASSERT_FALSE(HarmlessTextSkippers().empty());
  for (const HarmlessTextSkipper& skipper : HarmlessTextSkippers())
    EXPECT_NE(skipper.skip, nullptr) << skipper.name;
}

TEST_F(HarmlessTextTest, EveryByteAtEveryPlaceOfABlockIsSeenAlike) {
  for (int byte = 0; byte < 256; ++byte) {
    for (const std::size_t place : {0u, 1u, 15u, 16u, 31u, 32u, 62u, 63u, 64u, 65u, 127u, 128u, 199u}) {
      std::string spread(200, ' ');
      spread[place] = static_cast<char>(byte);
      ExpectNoDifference(spread);
      std::string inWord = "12 " + std::string(197, 'w') + ";\n-n 5;";
      inWord[place] = static_cast<char>(byte);
      ExpectNoDifference(inWord);
    }
  }
}

TEST_F(HarmlessTextTest, PairsOfBytesAcrossTheEdgeOfABlockAreSeenAlike) {
  for (const char first : std::string_view(" \n;\"/(:+-.09@AZ[`aczCS{\v\x80\0", 26)) {
    for (int second = 0; second < 256; ++second) {
      std::string text(140, ' ');
      text[63] = first;
      text[64] = static_cast<char>(second);
      ExpectNoDifference(text);
    }
  }
}

TEST_F(HarmlessTextTest, TextsOfEveryLengthAreSeenAlike) {
  for (const char fill : {' ', '\n', 'a', 'c', '1', '-', ';'})
    for (std::size_t size = 0; size < 200; ++size) {
      ExpectNoDifference(std::string(size, fill));
      ExpectNoDifference(std::string(size, fill) + ";");
      ExpectNoDifference(std::string(size, ' ') + std::string(70, fill) + "\n");
    }
}

TEST_F(HarmlessTextTest, ASceneIsSeenAlikeFromEveryByteOn) {
  const std::string scene = RichScene();
  for (std::size_t from = 0; from < scene.size(); ++from)
    ExpectNoDifference(std::string_view(scene).substr(from));
}

TEST_F(HarmlessTextTest, RandomTextsAreSeenAlike) {
  constexpr std::string_view kBytes = "  \n\t\r;;aCcsSzZ019.--\"/*():+_\xc3";
  std::mt19937 random(77);
  for (int round = 0; round < 5000; ++round) {
    std::string text(random() % 300, ' ');
    for (char& byte : text) {
      const auto choice = random() % (kBytes.size() * 3);
      byte = choice < kBytes.size() ? kBytes[choice] : (choice % 3 == 0 ? ' ' : 'w');
    }
    ExpectNoDifference(text);
  }
}

}  // namespace
}  // namespace testsupport
