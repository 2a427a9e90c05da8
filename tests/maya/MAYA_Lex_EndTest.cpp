// Quotes, comments, messages, and the end of the text.
#include <cstring>

#include "maya/MAYA_Lex.h"
#include "tests/maya/LexFixture.h"

using namespace mayaimport;

namespace testsupport {
namespace {

using namespace std::string_view_literals;

TEST_F(LexTest, AStringKeepsItsQuotes) {
  ExpectTokens("\"abc\" \"\" \"a;b //c\"", {{String, "\"abc\""}, {String, "\"\""}, {String, "\"a;b //c\""}});
}

TEST_F(LexTest, AStringNeedsNothingAfterIt) {
  ExpectTokens("\"a\"b \"c\"\"d\"",
               {{String, "\"a\""}, {Identifier, "b"}, {String, "\"c\""}, {String, "\"d\""}});
}

TEST_F(LexTest, AnEscapedQuoteStaysInsideTheString) {
  const Tokens one = {{String, "\"a\\\"b\""}};
  ASSERT_EQ(one.front().second.size(), 6u);
  ExpectTokens("\"a\\\"b\"", one);
}

TEST_F(LexTest, TwoBackslashesStillKeepTheQuoteFromClosing) {
  ExpectTokens(R"("a\\" b")", {{String, R"("a\\" b")"}});
  ExpectUnexpectedEnd(R"("a\\")");
}

TEST_F(LexTest, AStringThatIsNotClosedIsAnUnexpectedEnd) {
  for (const std::string_view text : {"\""sv, "\"a"sv, "\"\\\""sv, "\"a;\n"sv}) {
    SCOPED_TRACE(text);
    ExpectUnexpectedEnd(text);
  }
}

TEST_F(LexTest, ANulInsideAStringOrACommentIsAnUnexpectedEnd) {
  ExpectUnexpectedEnd("\"a\0b\" "sv);
  ExpectUnexpectedEnd("//a\0b\n "sv);
  ExpectUnexpectedEnd("/*a\0b*/ "sv);
  ExpectUnexpectedEnd("/*\0*/ "sv);
  ExpectUnexpectedEnd("/* *\0/ */ "sv);
}

TEST_F(LexTest, ThePositionStaysOnTheNulOfAnUnexpectedEnd) {
  for (const char* const open : {"\"ab", "//ab", "/*ab", "/* *", "ab", "-ab", "12"}) {
    SCOPED_TRACE(open);
    const GuardedText text(open);
    MAYA_Lex lex(host_.basicSuite(), text.begin(), text.end());
    const char* start = nullptr;
    const char* last = nullptr;
    EXPECT_THROW(lex.GetNextToken(&start, &last), int);
    EXPECT_EQ(lex.position, text.end());
  }
}

TEST_F(LexTest, NothingIsPassedOverAfterTheEnd) {
  const GuardedText text("a ");
  MAYA_Lex lex(host_.basicSuite(), text.begin(), text.end());
  const char* start = nullptr;
  const char* last = nullptr;
  while (lex.GetNextToken(&start, &last) != EndOfFile) continue;
  const char* const passed = lex.position;
  ASSERT_EQ(passed, text.end() + 1);
  lex.SkipHarmless();
  EXPECT_EQ(lex.position, passed);
  lex.SkipWhiteSpace();
  EXPECT_EQ(lex.position, passed);
  EXPECT_EQ(lex.SkipCharacters("a"), 0);
  EXPECT_EQ(lex.position, passed);
  lex.SkipHarmlessInCommand();
  EXPECT_EQ(lex.position, passed);
}

TEST_F(LexTest, ALineCommentTakesItsLineEndAlong) {
  ExpectTokens("//a b\nc ", {{Comment, "//a b\n"}, {Identifier, "c"}});
  ExpectTokens("//a\r\nc ", {{Comment, "//a\r"}, {Identifier, "c"}});
  ExpectTokens("//\n///*\n", {{Comment, "//\n"}, {Comment, "///*\n"}});
}

TEST_F(LexTest, ALineCommentAtTheEndOfTheTextIsRejected) {
  ExpectUnexpectedEnd("a //", {{Identifier, "a"}});
  ExpectUnexpectedEnd("// End");
}

TEST_F(LexTest, ABlockCommentEndsAtItsClosingPair) {
  ExpectTokens("/**/a ", {{Comment, "/**/"}, {Identifier, "a"}});
  ExpectTokens("/* \n x; \" */ a ", {{Comment, "/* \n x; \" */"}, {Identifier, "a"}});
  ExpectTokens("/****/a ", {{Comment, "/****/"}, {Identifier, "a"}});
}

TEST_F(LexTest, SlashThreeStarsDoesNotCloseComment) {
  ExpectTokens("/***/ a */ b ", {{Comment, "/***/ a */"}, {Identifier, "b"}});
  // The second comment's own stars are read as a pair too.
  ExpectUnexpectedEnd("/***/ a /**/ b ");
  ExpectUnexpectedEnd("/***/ a ");
}

TEST_F(LexTest, AStarReadAsTheSecondOfAPairClosesNothing) {
  ExpectUnexpectedEnd("/* **/");
  ExpectTokens("/* ***/a ", {{Comment, "/* ***/"}, {Identifier, "a"}});
  ExpectTokens("/* *x*/a ", {{Comment, "/* *x*/"}, {Identifier, "a"}});
}

TEST_F(LexTest, ABlockCommentThatIsNotClosedIsAnUnexpectedEnd) {
  for (const char* const text : {"/*", "/*/", "/**", "/* *", "/* a", "/*\n"}) {
    SCOPED_TRACE(text);
    ExpectUnexpectedEnd(text);
  }
}

TEST_F(LexTest, AWordThatRunsIntoTheEndIsAnUnexpectedEnd) {
  for (const char* const word : {"a", "createNode", "file", "-n", "12", "-1", ".", "--", "a\"b"}) {
    SCOPED_TRACE(word);
    ExpectUnexpectedEnd("; " + std::string(word), {{Semicolon, ";"}});
  }
  ExpectUnexpectedEnd("ab\0cd"sv);
  ExpectUnexpectedEnd("ab\0"sv);
}

TEST_F(LexTest, AnEmptyTextIsTheEndAtOnceAndMovesOneOnce) {
  const GuardedText text("");
  MAYA_Lex lex(host_.basicSuite(), text.begin(), text.end());
  for (int call = 0; call < 3; ++call) {
    const char* start = nullptr;
    const char* last = nullptr;
    EXPECT_EQ(lex.GetNextToken(&start, &last), EndOfFile);
    EXPECT_EQ(start, text.end());
    EXPECT_EQ(last, text.end());
    EXPECT_EQ(lex.position, text.end() + 1);
    EXPECT_EQ(lex.tokenStart, text.end() + 1);
  }
  EXPECT_EQ(lex.line, 0);
}

TEST_F(LexTest, TheEndIsGivenAgainHoweverOftenItIsAskedFor) {
  const GuardedText text("a ;\n");
  MAYA_Lex lex(host_.basicSuite(), text.begin(), text.end());
  const char* start = nullptr;
  const char* last = nullptr;
  EXPECT_EQ(lex.GetNextToken(&start, &last), Identifier);
  EXPECT_EQ(lex.GetNextToken(&start, &last), Semicolon);
  for (int call = 0; call < 3; ++call) {
    EXPECT_EQ(lex.GetNextToken(&start, &last), EndOfFile);
    EXPECT_EQ(start, text.end());
    EXPECT_EQ(lex.position, text.end() + 1);
    EXPECT_EQ(lex.line, 1);
  }
}

TEST_F(LexTest, WithoutAGivenEndTheFirstNulIsTheEnd) {
  const GuardedText text("a b ");
  MAYA_Lex lex(host_.basicSuite(), text.begin());
  const char* start = nullptr;
  const char* last = nullptr;
  EXPECT_EQ(lex.GetNextToken(&start, &last), Identifier);
  EXPECT_EQ(lex.GetNextToken(&start, &last), Identifier);
  EXPECT_EQ(lex.GetNextToken(&start, &last), EndOfFile);
  EXPECT_EQ(start, text.end());

  const GuardedText word("ab\0cd "sv);
  MAYA_Lex inWord(host_.basicSuite(), word.begin());
  EXPECT_THROW(inWord.GetNextToken(&start, &last), int);
}

TEST_F(LexTest, ANullBufferIsAnEmptyText) {
  MAYA_Lex lex(host_.basicSuite(), nullptr);
  for (int call = 0; call < 2; ++call) {
    const char* start = nullptr;
    const char* last = nullptr;
    EXPECT_EQ(lex.GetNextToken(&start, &last), EndOfFile);
    ASSERT_NE(start, nullptr);
    EXPECT_EQ(*start, '\0');
    EXPECT_EQ(last, start);
  }
}

TEST_F(LexTest, ANulWhereATokenWouldStartIsTheEndWhereverItStands) {
  ExpectTokens("a \0b c "sv, {{Identifier, "a"}});
  ExpectTokens("\0b "sv, {});
  ExpectTokens("\"a\"\0\"b\""sv, {{String, "\"a\""}});
}

TEST_F(LexTest, NothingIsReadAfterANulThatWasTheEnd) {
  const GuardedText text("a \0b "sv);
  MAYA_Lex lex(host_.basicSuite(), text.begin(), text.end());
  const char* start = nullptr;
  const char* last = nullptr;
  EXPECT_EQ(lex.GetNextToken(&start, &last), Identifier);
  for (int call = 0; call < 3; ++call) {
    EXPECT_EQ(lex.GetNextToken(&start, &last), EndOfFile);
    EXPECT_EQ(start, text.begin() + 2);
    EXPECT_EQ(lex.position, text.begin() + 3);
  }
}

TEST_F(LexTest, AMessageGoesToTheUserWithThePluginsId) {
  const GuardedText text("");
  MAYA_Lex lex(host_.basicSuite(), text.begin(), text.end());
  lex.ReportError("first");
  lex.ReportError("second");
  ASSERT_EQ(host_.messages.size(), 2u);
  EXPECT_EQ(host_.messages[0].pluginId, kTestPluginId);
  EXPECT_THAT(Messages(), ::testing::ElementsAre("first", "second"));
  EXPECT_THAT(host_.acquisitions, ::testing::ElementsAre(SuiteKey("QZGP Utility Suite", 7)));
}

TEST_F(LexTest, AMessageThatCannotBeShownChangesNothing) {
  host_.showMessageError = 99;
  ExpectReadingError("$ ");
  ExpectUnexpectedEnd("\"");
}

TEST_F(LexTest, WithoutTheUtilitySuiteALexicalErrorIsTheMissingSuite) {
  host_.acquireErrors[{"QZGP Utility Suite", 7}] = 1;
  EXPECT_EQ(Cut("$ ").code, 13);
  EXPECT_EQ(Cut("\"").code, 13);
  EXPECT_THAT(Messages(), ::testing::IsEmpty());
}

TEST_F(LexTest, AFailureThrowsItsCodeAfterItsMessage) {
  const GuardedText text("");
  MAYA_Lex lex(host_.basicSuite(), text.begin(), text.end());
  EXPECT_THAT([&] { lex.FailReading(); }, ::testing::Throws<int>(::testing::Eq(0x13AF01)));
  EXPECT_THAT([&] { lex.FailAtEnd(); }, ::testing::Throws<int>(::testing::Eq(0x13AF02)));
  EXPECT_THAT(Messages(), ::testing::ElementsAre(kReadingText, kUnexpectedEndText));
}

}  // namespace
}  // namespace testsupport
