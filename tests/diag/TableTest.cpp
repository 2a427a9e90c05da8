// The table of codes, and the page that is made from it.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <iterator>
#include <set>
#include <string>
#include <vector>

#include "diag/Codes.h"
#include "diag/Diagnostic.h"
#include "diag/Page.h"

namespace diag {
namespace {

using testing::HasSubstr;

std::string FileText(const std::string& name) {
  std::ifstream in(std::string(MAYASCENE_SOURCE_DIR) + '/' + name, std::ios::binary);
  EXPECT_TRUE(in) << name;
  return {std::istreambuf_iterator<char>(in), {}};
}

TEST(TableTest, IsInTheOrderOfItsNumbersWithoutARepetition) {
  ASSERT_FALSE(Table().empty());
  EXPECT_TRUE(std::is_sorted(Table().begin(), Table().end(),
                             [](const Entry& a, const Entry& b) { return a.code <= b.code; }));
  std::set<std::string_view> symbols;
  for (const Entry& entry : Table()) EXPECT_TRUE(symbols.insert(entry.symbol).second) << entry.symbol;
}

// The enumeration cannot be listed by the program: its text is.
TEST(TableTest, EveryCodeHasARowUnderItsOwnName) {
  const std::string header = FileText("diag/Codes.h");
  std::size_t listed = 0;
  const std::size_t begin = header.find("enum class Code");
  const std::size_t end = header.find("};", begin);
  for (std::size_t at = header.find(" = ", begin); at < end; at = header.find(" = ", at + 1)) ++listed;
  EXPECT_EQ(Table().size(), listed);
  for (const Entry& entry : Table()) {
    const std::string line =
        "  " + std::string(entry.symbol) + " = " + std::to_string(static_cast<int>(entry.code)) + ",";
    EXPECT_THAT(header, HasSubstr(line));
    EXPECT_EQ(&EntryOf(entry.code), &entry);
  }
}

TEST(TableTest, EveryRowSaysWhatItMeansAndWhatToDoAndHasAnExample) {
  for (const Entry& entry : Table()) {
    SCOPED_TRACE(std::string(entry.symbol));
    EXPECT_GE(static_cast<int>(entry.code), 100);
    EXPECT_FALSE(entry.sentence.empty());
    EXPECT_FALSE(entry.example.empty());
    EXPECT_NE(entry.sentence.back(), '.');
    for (const std::string_view text : {entry.meaning, entry.help}) {
      ASSERT_FALSE(text.empty());
      EXPECT_EQ(text.back(), '.');
    }
  }
}

TEST(TableTest, TheArgumentsAreCountedByTheirPlaceholders) {
  EXPECT_EQ(ArgumentCount(EntryOf(Code::OpenString)), 0u);
  EXPECT_EQ(ArgumentCount(EntryOf(Code::CommandCutOff)), 1u);
  EXPECT_EQ(ArgumentCount(EntryOf(Code::ParentInReference)), 3u);
  // Every argument has a place in the sentence, but for one that only the help uses.
  for (const Entry& entry : Table()) {
    for (std::size_t i = 0; i < ArgumentCount(entry); ++i) {
      const std::string placeholder = '{' + std::to_string(i) + '}';
      EXPECT_THAT(std::string(entry.sentence) + std::string(entry.help), HasSubstr(placeholder))
          << entry.symbol;
    }
  }
}

// The texts are formats: a brace that is none would end the tool when the diagnostic shows.
TEST(TableTest, EveryTextTakesItsArgumentsAndShowsAMissingOneAsNothing) {
  const auto of = [](Code code, const std::vector<std::string>& arguments) {
    return Diagnostic{.code = code, .range = {}, .place = {}, .arguments = arguments};
  };
  for (const Entry& entry : Table()) {
    for (const auto& arguments : {std::vector<std::string>(), {"{0}", "{}", "}", "{", "%s"}}) {
      EXPECT_NO_THROW(SentenceOf(of(entry.code, arguments))) << entry.symbol;
      EXPECT_NO_THROW(HelpOf(of(entry.code, arguments))) << entry.symbol;
    }
  }
  EXPECT_EQ(SentenceOf(of(Code::CommandCutOff, {})), SentenceOf(of(Code::CommandCutOff, {""})));
  EXPECT_THAT(SentenceOf(of(Code::CommandCutOff, {"{1}"})), HasSubstr("{1}"));
}

TEST(TableTest, ANameHasFourDigits) {
  EXPECT_EQ(NameOf(Code::OpenString), "MA0101");
  EXPECT_EQ(NameOf(Severity::Note), "note");
  EXPECT_EQ(NameOf(Severity::Warning), "warning");
  EXPECT_EQ(NameOf(Severity::Error), "error");
}

TEST(TableTest, ThePageIsWhatTheTableGives) {
  EXPECT_EQ(FileText("docs/diagnostics.md"), Page()) << "diagnostics-page prints the page anew";
}

}  // namespace
}  // namespace diag
