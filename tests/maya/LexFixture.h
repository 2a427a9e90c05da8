// A text cut into tokens, up to the end or to the error that stops the lexer.
#pragma once

#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "tests/support/ReaderFixture.h"

namespace testsupport {

using Tokens = std::vector<std::pair<MayaToken, std::string>>;  // without the EndOfFile

class LexTest : public ReaderTest {
 protected:
  struct Outcome {
    Tokens tokens;
    HostError code = 0;
  };

  Outcome Cut(std::string_view text) {
    const GuardedText guarded(text);
    host_.messages.clear();
    MAYA_Lex lex(host_.basicSuite(), guarded.begin(), guarded.end());
    Outcome outcome;
    try {
      const char* start = nullptr;
      const char* last = nullptr;
      for (MayaToken kind; (kind = lex.GetNextToken(&start, &last)) != EndOfFile;) {
        EXPECT_EQ(lex.position, last + 1);
        EXPECT_EQ(lex.tokenStart, last + 1);
        outcome.tokens.emplace_back(kind, std::string(start, last + 1));
      }
    } catch (int code) {
      outcome.code = code;
    }
    return outcome;
  }

  // The text is read to its end in good order.
  void ExpectTokens(std::string_view text, const Tokens& expected) {
    const Outcome outcome = Cut(text);
    EXPECT_EQ(outcome.code, 0);
    EXPECT_EQ(outcome.tokens, expected);
    EXPECT_THAT(Messages(), ::testing::IsEmpty());
  }

  // The text gives these tokens, then the error with its one message.
  void ExpectError(std::string_view text, const Tokens& before, HostError code, const char* message) {
    const Outcome outcome = Cut(text);
    EXPECT_EQ(outcome.code, code);
    EXPECT_EQ(outcome.tokens, before);
    EXPECT_THAT(Messages(), ::testing::ElementsAre(message));
  }

  void ExpectReadingError(std::string_view text, const Tokens& before = {}) {
    ExpectError(text, before, 1289985, kReadingText);
  }

  void ExpectUnexpectedEnd(std::string_view text, const Tokens& before = {}) {
    ExpectError(text, before, 1289986, kUnexpectedEndText);
  }
};

}  // namespace testsupport
