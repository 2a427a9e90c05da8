// Passing over what the main loop ignores in bulk changes nothing of what the loop sees.
#include "scan/SkipText.h"

#include <map>

#include "tests/maya/RichScene.h"
#include "tests/scan/HostileTexts.h"
#include "tests/support/GuardedMemory.h"
#include "tests/support/ReaderFixture.h"
#include "tests/support/WideTests.h"

namespace testsupport {
namespace {

class SkipTextTest : public ReaderTest {
 protected:
  struct ActingToken {
    MayaToken kind;
    std::ptrdiff_t first;
    std::ptrdiff_t last;
    bool operator==(const ActingToken&) const = default;
  };

  struct Seen {
    std::vector<ActingToken> acting;  // all but the tokens that a skipper may pass over
    HostError code = 0;
    std::string message;
    std::int32_t line = 0;
    std::ptrdiff_t position = 0;
    bool operator==(const Seen&) const = default;
  };

  enum class Where { BetweenCommands, InCommand };

  // What a loop that skips before every token sees; without a skipper, one that does not.
  void See(const char* begin, const char* end, Where where, scan::SkipText skip, Seen* seen) {
    seen->acting.clear();
    seen->code = 0;
    host_.messages.clear();
    host_.acquisitions.clear();
    host_.releases.clear();
    MAYA_Lex lex(host_.basicSuite(), begin, end);
    try {
      for (MayaToken kind = Unknown; kind != EndOfFile;) {
        if (skip != nullptr) {
          const char* const from = lex.position;
          lex.position = skip(from, end, &lex.line);
          lex.tokenStart = lex.position;
          bytesSkipped_ += lex.position - from;
        }
        const char* start = nullptr;
        const char* last = nullptr;
        kind = lex.GetNextToken(&start, &last);
        if (!MayBePassedOver(where, kind, *start))
          seen->acting.push_back({kind, start - begin, last - begin});
      }
    } catch (int code) {
      seen->code = code;
    }
    seen->message = host_.messages.empty() ? "" : host_.messages.back().text;
    seen->line = lex.line;
    seen->position = lex.position - begin;
  }

  static bool MayBePassedOver(Where where, MayaToken kind, char first) {
    const bool keywordStart = first == 'c' || first == 'C' || first == 's' || first == 'S';
    const bool word = kind == Identifier || (kind >= File && kind <= CurrentUnit);
    if (kind == Number || (word && !keywordStart)) return where == Where::BetweenCommands || first != '-';
    return where == Where::BetweenCommands && (kind == Semicolon || kind == Option);
  }

  // The text's NUL is followed by `gap` bytes that may be read.
  void ExpectNoDifference(std::string_view text, std::size_t gap = 0) {
    const char* const end = room_.Put(text, gap);
    ExpectNoDifference(end - text.size(), end, gap);
  }

  void ExpectNoDifference(const char* begin, const char* end, std::size_t gap) {
    ExpectNoDifference(begin, end, Where::BetweenCommands, gap);
    ExpectNoDifference(begin, end, Where::InCommand, gap);
  }

  void ExpectNoDifference(const char* begin, const char* end, Where where, std::size_t gap) {
    const std::string_view text(begin, static_cast<std::size_t>(end - begin));
    See(begin, end, where, nullptr, &plain_);
    for (const scan::TextSkipper& skipper : scan::TextSkippers()) {
      const bool between = where == Where::BetweenCommands;
      See(begin, end, where, between ? skipper.betweenCommands : skipper.inCommand, &skipped_);
      ASSERT_TRUE(skipped_ == plain_)
          << skipper.name << (between ? " between commands" : " in a command") << " over "
          << ::testing::PrintToString(std::string(text)) << ", gap " << gap << ": tokens "
          << skipped_.acting.size() << " and " << plain_.acting.size() << ", code " << skipped_.code
          << " and " << plain_.code << ", line " << skipped_.line << " and " << plain_.line << ", position "
          << skipped_.position << " and " << plain_.position;
    }
  }

  GuardedMemory room_;
  Seen plain_;
  Seen skipped_;
  std::int64_t bytesSkipped_ = 0;
};

TEST_F(SkipTextTest, ThereIsOneForEveryProcessor) {
  ASSERT_FALSE(scan::TextSkippers().empty());
  for (const scan::TextSkipper& skipper : scan::TextSkippers())
    EXPECT_TRUE(skipper.betweenCommands != nullptr && skipper.inCommand != nullptr) << skipper.name;
}

TEST_F(SkipTextTest, EveryByteAtEveryPlaceOfABlockIsSeenAlike) {
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

// Blocks in which nothing stops, as most of a scene is: numbers, white space and words.
std::string QuietText(std::size_t size) {
  constexpr std::string_view kQuiet = "12.5 -0.25 1e-3 f 4 -7 22 mu 0 4 .5;\r\n\t\tno 300 -9 v ";
  std::string text;
  while (text.size() < size) text += kQuiet;
  return text.substr(text.size() - size);
}

TEST_F(SkipTextTest, EveryByteAmongQuietBlocksIsSeenAlike) {
  const std::string quiet = QuietText(330) + " ;";
  for (int byte = 0; byte < 256; ++byte) {
    for (std::size_t place = 120; place < 200; ++place) {
      std::string text = quiet;
      text[place] = static_cast<char>(byte);
      ExpectNoDifference(text);
    }
  }
}

TEST_F(SkipTextTest, EveryByteAfterADashAmongQuietBlocksIsSeenAlike) {
  for (int byte = 0; byte < 256; ++byte) {
    for (std::size_t place = 124; place < 132; ++place) {
      for (const char before : {' ', '\n', ';', '-', '1', 'x'}) {
        std::string text(330, ' ');
        text[place - 1] = before;
        text[place] = '-';
        text[place + 1] = static_cast<char>(byte);
        ExpectNoDifference(text);
      }
    }
  }
}

TEST_F(SkipTextTest, LineFeedsInLongQuietTextsAreCounted) {
  constexpr std::int32_t kLongest = 3 * 127 * 64 + 200;  // where counters of a byte are full three times
  for (const std::int32_t feeds :
       {63, 64, 128, 255 * 64, 127 * 64 + 64, 2 * 127 * 64 + 65, 63 * 64 + 64, kLongest}) {
    std::string text(static_cast<std::size_t>(feeds), '\n');
    text += "\"" + std::string(100, ' ');
    for (const scan::TextSkipper& skipper : scan::TextSkippers()) {
      for (const scan::SkipText skip : {skipper.betweenCommands, skipper.inCommand}) {
        std::int32_t lines = 5;
        EXPECT_EQ(skip(text.data(), text.data() + text.size(), &lines) - text.data(), feeds) << skipper.name;
        EXPECT_EQ(lines, 5 + feeds) << skipper.name;
      }
    }
  }
}

TEST_F(SkipTextTest, NothingBeforeThePositionIsRead) {
  for (const std::string& text :
       {QuietText(400), std::string(400, '-'), std::string(400, ' '), std::string("c")}) {
    const char* const end = room_.PutFirst(text);
    ExpectNoDifference(end - text.size(), end, 0);
  }
}

// The example in the head comment of scan/SkipTextBlocks.h.
TEST_F(SkipTextTest, TheExampleStopsAtItsKeyword) {
  const std::string text = "2.5 -1; setAttr " + std::string(200, ' ');
  for (const scan::TextSkipper& skipper : scan::TextSkippers()) {
    std::int32_t lines = 0;
    EXPECT_EQ(skipper.betweenCommands(text.data(), text.data() + text.size(), &lines) - text.data(), 8);
    EXPECT_EQ(skipper.inCommand(text.data(), text.data() + text.size(), &lines) - text.data(), 4);
  }
}

// A skipper that stops where it need not is right all the same, but slow.
TEST_F(SkipTextTest, EveryOneGoesAsFarAsItMay) {
  constexpr std::string_view kWhiteSpace = " \t\r\n;";
  constexpr std::string_view kNumeral = "0123456789.";
  for (int value = 1; value < 256; ++value) {
    const char byte = static_cast<char>(value);
    const bool letter = (byte >= 'A' && byte <= 'Z') || (byte >= 'a' && byte <= 'z');
    const bool keyword = byte == 'c' || byte == 'C' || byte == 's' || byte == 'S';
    const bool numeral = kNumeral.find(byte) != std::string_view::npos;
    const bool white = kWhiteSpace.find(byte) != std::string_view::npos;
    for (const std::size_t place : {0u, 17u, 40u, 63u, 64u, 100u, 127u}) {
      std::string text(256, ' ');
      text[place] = byte;
      std::string option = text;
      option[place] = '-';
      option[place + 1] = byte;
      for (const scan::TextSkipper& skipper : scan::TextSkippers()) {
        const auto stop = [](const auto skip, const std::string& in) {
          std::int32_t lines = 0;
          return static_cast<std::size_t>(skip(in.data(), in.data() + in.size(), &lines) - in.data());
        };
        const bool harmless = white || numeral || (letter && !keyword);
        EXPECT_EQ(stop(skipper.betweenCommands, text) > 128, harmless)
            << skipper.name << " " << value << " at " << place;
        EXPECT_EQ(stop(skipper.inCommand, text) > 128, harmless && byte != ';') << skipper.name << value;
        EXPECT_EQ(stop(skipper.betweenCommands, option) > 128, letter || numeral || byte == '-')
            << skipper.name << " -" << value << " at " << place;
      }
    }
  }
}

TEST_F(SkipTextTest, PairsOfBytesAcrossTheEdgeOfABlockAreSeenAlike) {
  for (const char first : std::string_view(" \n;\"/(:+-.09@AZ[`aczCS{\v\x80\0", 26)) {
    for (int second = 0; second < 256; ++second) {
      std::string text(140, ' ');
      text[63] = first;
      text[64] = static_cast<char>(second);
      ExpectNoDifference(text);
    }
  }
}

TEST_F(SkipTextTest, TextsOfEveryLengthAreSeenAlike) {
  for (const char fill : {' ', '\n', 'a', 'c', '1', '-', ';'})
    for (std::size_t size = 0; size < 200; ++size) {
      ExpectNoDifference(std::string(size, fill));
      ExpectNoDifference(std::string(size, fill) + ";");
      ExpectNoDifference(std::string(size, ' ') + std::string(70, fill) + "\n");
    }
}

TEST_F(SkipTextTest, ASceneIsSeenAlikeFromEveryByteOn) {
  const std::string scene = RichScene();
  for (std::size_t from = 0; from < scene.size(); ++from)
    ExpectNoDifference(std::string_view(scene).substr(from));
}

TEST_F(SkipTextTest, ASceneIsSeenAlikeAtEveryAlignment) {
  const std::string scene = RichScene();
  for (std::size_t gap = 0; gap < 128; ++gap) ExpectNoDifference(scene, gap);
}

const int kRandomTexts = static_cast<int>(HowMany({.quick = 30'000, .wide = 300'000, .sanitized = 100'000}));

TEST_F(SkipTextTest, RandomHostileTextsAreSeenAlike) {
  HostileTexts texts(20240229);
  std::int64_t bytes = 0;
  std::int64_t acting = 0;
  std::map<HostError, int> outcomes;
  for (int i = 0; i < kRandomTexts; ++i) {
    // Half of them come after quiet blocks.
    std::string text = QuietText(static_cast<std::size_t>(texts.Pick(0, 1) * texts.Pick(0, 300)));
    text += texts.Next();
    // Half of them end at the edge of what may be read, half at any alignment before it.
    const int gap = texts.Pick(0, 1) * texts.Pick(0, 63);
    ASSERT_NO_FATAL_FAILURE(ExpectNoDifference(text, static_cast<std::size_t>(gap)));
    bytes += static_cast<std::int64_t>(text.size());
    acting += static_cast<std::int64_t>(plain_.acting.size());
    ++outcomes[plain_.code];
  }
  // The texts reach what they are meant to reach.
  for (const HostError code : {0, 1289985, 1289986}) EXPECT_GT(outcomes[code], kRandomTexts / 10) << code;
  EXPECT_EQ(outcomes.size(), 3u);
  EXPECT_GT(acting, kRandomTexts);
  EXPECT_GT(bytesSkipped_, bytes / 10);
}

}  // namespace
}  // namespace testsupport
