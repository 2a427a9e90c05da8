// Kinds of token, where each begins and ends.
#include "maya/MAYA_Lex.h"

#include "tests/maya/LexFixture.h"

using namespace mayaimport;

namespace testsupport {
namespace {

using namespace std::string_view_literals;

TEST(MayaTokenTest, EveryKindHasItsFixedNumber) {
  const std::vector<std::int32_t> kinds = {
      Unknown,     Comment,        File,   Requires,    CreateNode, SetAttr,  AddAttr,   Parent,
      ConnectAttr, DisconnectAttr, Select, CurrentUnit, Identifier, Number,   OpenParen, CloseParen,
      Plus,        Option,         String, Semicolon,   Colon,      EndOfFile};
  ASSERT_EQ(kinds.size(), 22u);
  for (std::size_t number = 0; number < kinds.size(); ++number)
    EXPECT_EQ(kinds[number], static_cast<std::int32_t>(number));
}

TEST_F(LexTest, KeywordsAreRecognisedInAnyCase) {
  const std::vector<std::pair<const char*, MayaToken>> keywords = {
      {"file", File},
      {"requires", Requires},
      {"createNode", CreateNode},
      {"setAttr", SetAttr},
      {"addAttr", AddAttr},
      {"parent", Parent},
      {"connectAttr", ConnectAttr},
      {"disconnectAttr", DisconnectAttr},
      {"select", Select},
      {"currentUnit", CurrentUnit},
  };
  for (const auto& [word, kind] : keywords) {
    for (const std::string& form : CaseChanges(word)) {
      SCOPED_TRACE(form);
      ExpectTokens(form + " ", {{kind, form}});
      ExpectTokens(form + ";", {{kind, form}, {Semicolon, ";"}});
    }
  }
}

TEST_F(LexTest, AKeywordWithMoreOrFewerLettersIsAnIdentifier) {
  ExpectTokens("createNodes createNod fil files selects currentunit2\n", {{Identifier, "createNodes"},
                                                                          {Identifier, "createNod"},
                                                                          {Identifier, "fil"},
                                                                          {Identifier, "files"},
                                                                          {Identifier, "selects"},
                                                                          {Identifier, "currentunit2"}});
}

TEST_F(LexTest, AKeywordWithANulInsideIsAnIdentifier) {
  ExpectTokens("select\0 file\0x sel\0ect "sv, {{Identifier, std::string("select\0", 7)},
                                                {Identifier, std::string("file\0x", 6)},
                                                {Identifier, std::string("sel\0ect", 7)}});
}

TEST_F(LexTest, AWordOf256BytesOrMoreIsAnIdentifier) {
  for (const std::size_t length : {255u, 256u, 257u, 5000u}) {
    const std::string word = "file" + std::string(length - 4, 'e');
    ExpectTokens(word + " ", {{Identifier, word}});
  }
}

TEST_F(LexTest, AWordHoldsEverythingUpToATerminator) {
  ExpectTokens("a\"b[0].c:d(e)+/*x*/|-_$#\x80\v\f z ",
               {{Identifier, "a\"b[0].c:d(e)+/*x*/|-_$#\x80\v\f"}, {Identifier, "z"}});
}

TEST_F(LexTest, EachTerminatorEndsAWord) {
  ExpectTokens("a\tb\nc\rd e;f ", {{Identifier, "a"},
                                   {Identifier, "b"},
                                   {Identifier, "c"},
                                   {Identifier, "d"},
                                   {Identifier, "e"},
                                   {Semicolon, ";"},
                                   {Identifier, "f"}});
}

TEST_F(LexTest, ASemicolonSeparatesWordsWithoutBlanks) {
  ExpectTokens("abc;def ", {{Identifier, "abc"}, {Semicolon, ";"}, {Identifier, "def"}});
}

TEST_F(LexTest, ANulDoesNotEndAWord) {
  ExpectTokens("ab\0cd;"sv, {{Identifier, std::string("ab\0cd", 5)}, {Semicolon, ";"}});
}

TEST_F(LexTest, WordsThatBeginLikeANumberAreNumbers) {
  ExpectTokens("-1.5 -.5 --x .translate 23.976fps 0 9z 5. -9\"a .[;", {{Number, "-1.5"},
                                                                       {Number, "-.5"},
                                                                       {Number, "--x"},
                                                                       {Number, ".translate"},
                                                                       {Number, "23.976fps"},
                                                                       {Number, "0"},
                                                                       {Number, "9z"},
                                                                       {Number, "5."},
                                                                       {Number, "-9\"a"},
                                                                       {Number, ".["},
                                                                       {Semicolon, ";"}});
}

TEST_F(LexTest, ADashBeforeALetterIsAnOption) {
  ExpectTokens("-n -Z:1\"x -type\"double3\";",
               {{Option, "-n"}, {Option, "-Z:1\"x"}, {Option, "-type\"double3\""}, {Semicolon, ";"}});
}

TEST_F(LexTest, ADashBeforeAnythingElseIsUnknown) {
  ExpectTokens("- -;-\t-\"a\"-( -:-+ ", {{Unknown, "-"},
                                         {Unknown, "-"},
                                         {Semicolon, ";"},
                                         {Unknown, "-"},
                                         {Unknown, "-"},
                                         {String, "\"a\""},
                                         {Unknown, "-"},
                                         {OpenParen, "("},
                                         {Unknown, "-"},
                                         {Colon, ":"},
                                         {Unknown, "-"},
                                         {Plus, "+"}});
  ExpectTokens("-", {{Unknown, "-"}});
  ExpectReadingError("-_ ", {{Unknown, "-"}});
  ExpectReadingError("-\xc3\xa9 ", {{Unknown, "-"}});
}

TEST_F(LexTest, PunctuationIsOneByteEach) {
  ExpectTokens("()+;:+5 :a:b ", {{OpenParen, "("},
                                 {CloseParen, ")"},
                                 {Plus, "+"},
                                 {Semicolon, ";"},
                                 {Colon, ":"},
                                 {Plus, "+"},
                                 {Number, "5"},
                                 {Colon, ":"},
                                 {Identifier, "a:b"}});
}

// What each byte gives where a token starts, with a blank after it.
TEST_F(LexTest, EveryFirstByteGivesTheKindOfItsClass) {
  for (int byte = 1; byte < 256; ++byte) {
    SCOPED_TRACE(byte);
    const std::string one(1, static_cast<char>(byte));
    const std::string text = one + " ";
    const bool letter = (byte >= 'a' && byte <= 'z') || (byte >= 'A' && byte <= 'Z');
    if (letter) {
      ExpectTokens(text, {{Identifier, one}});
    } else if ((byte >= '0' && byte <= '9') || byte == '.') {
      ExpectTokens(text, {{Number, one}});
    } else if (byte == '\t' || byte == '\r' || byte == '\n' || byte == ' ') {
      ExpectTokens(text, {});
    } else if (byte == '"') {
      ExpectUnexpectedEnd(text);
    } else if (std::string_view("()+;:-").find(one) != std::string_view::npos) {
      EXPECT_EQ(Cut(text).tokens.size(), 1u);
      EXPECT_EQ(Cut(text).code, 0);
    } else {
      ExpectReadingError(text);
    }
  }
}

TEST_F(LexTest, TheByteOfAReadingErrorIsWhereThePositionStays) {
  for (const char* const word :
       {"#", "$", "%", "&", "'", "*", ",", "!", "[", "_", "|", "{", "/a", "/", "|a|b"}) {
    SCOPED_TRACE(word);
    ExpectReadingError("abc " + std::string(word) + " ", {{Identifier, "abc"}});
    const GuardedText text(std::string(word) + " ");
    MAYA_Lex lex(host_.basicSuite(), text.begin(), text.end());
    const char* start = nullptr;
    const char* last = nullptr;
    EXPECT_THROW(lex.GetNextToken(&start, &last), int);
    EXPECT_EQ(lex.tokenStart, text.begin());
    EXPECT_EQ(lex.position, text.begin());
  }
}

TEST_F(LexTest, LineFeedsAreCountedOnlyAsWhiteSpace) {
  const GuardedText text("\n \r\n a\n// one\n/* two\n */ \"three\n\" b\n");
  MAYA_Lex lex(host_.basicSuite(), text.begin(), text.end());
  EXPECT_EQ(lex.line, 0);
  const char* start = nullptr;
  const char* last = nullptr;
  std::vector<std::int32_t> lines;
  while (lex.GetNextToken(&start, &last) != EndOfFile) lines.push_back(lex.line);
  EXPECT_THAT(lines, ::testing::ElementsAre(2, 3, 3, 3, 3));
  EXPECT_EQ(lex.line, 4);
}

TEST_F(LexTest, SkipWhiteSpaceStopsAtTheFirstOtherByte) {
  const GuardedText text("\t\r\n \v");
  MAYA_Lex lex(host_.basicSuite(), text.begin(), text.end());
  lex.SkipWhiteSpace();
  EXPECT_EQ(lex.position, text.begin() + 4);
  EXPECT_EQ(lex.tokenStart, text.begin() + 4);
  EXPECT_EQ(lex.line, 1);
}

TEST_F(LexTest, SkipCharactersPassesOverTheGivenSetAndNeverTheEnd) {
  const GuardedText text("xy\nyz");
  MAYA_Lex lex(host_.basicSuite(), text.begin(), text.end());
  EXPECT_EQ(lex.SkipCharacters(""), 0);
  EXPECT_EQ(lex.position, text.begin());
  EXPECT_EQ(lex.SkipCharacters("\nyx"), 0);
  EXPECT_EQ(lex.position, text.begin() + 4);
  EXPECT_EQ(lex.tokenStart, text.begin() + 4);
  EXPECT_EQ(lex.line, 1);
  EXPECT_EQ(lex.SkipCharacters("z"), 0);
  EXPECT_EQ(lex.position, text.end());
  EXPECT_EQ(lex.SkipCharacters("z"), 0);
  EXPECT_EQ(lex.position, text.end());
}

TEST_F(LexTest, AScannerLeavesThePositionOnTheLastByteOfItsToken) {
  struct Row {
    const char* text;
    MayaToken (MAYA_Lex::*scan)();
    MayaToken kind;
    int last;
  };
  const std::vector<Row> rows = {
      {"\"a b\" c", &MAYA_Lex::ParseQuote, String, 4},    {"// a\n b", &MAYA_Lex::ParseComment, Comment, 4},
      {"/* a */ b", &MAYA_Lex::ParseComment, Comment, 6}, {"-type b", &MAYA_Lex::ParseOption, Option, 4},
      {"select b", &MAYA_Lex::ParseID, Select, 5},        {"selected;b", &MAYA_Lex::ParseID, Identifier, 7},
      {"-12.5e3x b", &MAYA_Lex::ParseID, Number, 7},
  };
  for (const Row& row : rows) {
    SCOPED_TRACE(row.text);
    const GuardedText text(row.text);
    MAYA_Lex lex(host_.basicSuite(), text.begin(), text.end());
    EXPECT_EQ((lex.*row.scan)(), row.kind);
    EXPECT_EQ(lex.position, text.begin() + row.last);
  }
}

TEST_F(LexTest, ConstructionPointsEverythingAtTheText) {
  const GuardedText text(" a");
  const MAYA_Lex lex(host_.basicSuite(), text.begin(), text.end());
  EXPECT_EQ(lex.buffer, text.begin());
  EXPECT_EQ(lex.tokenStart, text.begin());
  EXPECT_EQ(lex.position, text.begin());
  EXPECT_EQ(lex.line, 0);
  EXPECT_THAT(host_.acquisitions, ::testing::IsEmpty());
}

}  // namespace
}  // namespace testsupport
