// The lexer: white space, words, strings and comments. Reads and writes `tokenStart`, `position` and `line`;
// calls the host only to show its two messages, and notes where they come from.
#include "maya/MAYA_Lex.h"

#include <algorithm>
#include <array>
#include <cstring>
#include <string_view>

#include "hostutil/HostUtilities.h"
#include "maya/Words.h"
#include "plugin/ErrorCodes.h"
#include "plugin/Globals.h"
#include "scan/ByteClasses.h"
#include "scan/FindEnd.h"
#include "scan/SkipText.h"

namespace mayaimport {

namespace {

struct Keyword {
  std::string_view word;
  MayaToken kind = Identifier;
};

constexpr Keyword kKeywords[] = {
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

constexpr std::size_t kLongestKeyword = std::ranges::max_element(kKeywords, {}, [](const Keyword& keyword) {
                                          return keyword.word.size();
                                        })->word.size();

// At most two keywords have the same length, and most other words have a length that no keyword has.
struct KeywordsOfLength {
  std::array<Keyword, 2> keywords{};
  std::size_t count = 0;
};

constexpr auto kKeywordsByLength = [] {
  std::array<KeywordsOfLength, kLongestKeyword + 1> table{};
  for (const Keyword& keyword : kKeywords) {
    KeywordsOfLength& entry = table[keyword.word.size()];
    entry.keywords[entry.count++] = keyword;
  }
  return table;
}();

MayaToken KeywordOrIdentifier(std::string_view word) {
  if (word.size() > kLongestKeyword) return Identifier;
  const KeywordsOfLength& candidates = kKeywordsByLength[word.size()];
  for (std::size_t i = 0; i < candidates.count; ++i) {
    if (SameWord(word, candidates.keywords[i].word)) return candidates.keywords[i].kind;
  }
  return Identifier;
}

}  // namespace

MAYA_Lex::MAYA_Lex(const WNBasicSuite* basicSuite, const char* text, const char* end)
    : QZGP_SuiteHandler(basicSuite),
      buffer(text != nullptr ? text : ""),
      tokenStart(buffer),
      position(buffer),
      end_(text != nullptr && end != nullptr ? end : buffer + std::strlen(buffer)) {}

void MAYA_Lex::SkipWhiteSpace() {
  if (position > end_) return;
  const char* at = position;
  for (; scan::IsWhiteSpace(*at); ++at) line += *at == '\n' ? 1 : 0;
  tokenStart = position = at;
}

MayaToken MAYA_Lex::GetNextToken(const char** start, const char** last) {
  if (position > end_) {
    *start = *last = end_;
    return EndOfFile;
  }
  SkipWhiteSpace();
  MayaToken kind = Unknown;
  switch (*position) {
    case '\0':
      kind = EndOfFile;
      end_ = position;  // nothing after this NUL is ever read
      break;
    case '"':
      kind = ParseQuote();
      break;
    case '/':
      kind = ParseComment();
      break;
    case '(':
      kind = OpenParen;
      break;
    case ')':
      kind = CloseParen;
      break;
    case '+':
      kind = Plus;
      break;
    case ';':
      kind = Semicolon;
      break;
    case ':':
      kind = Colon;
      break;
    case '-':
      if (scan::IsLetter(position[1])) {
        kind = ParseOption();
      } else if (scan::IsNumberStart(position[1])) {
        kind = ParseID();
      }
      break;
    default:
      kind = ParseID();
      break;
  }
  *start = tokenStart;
  *last = position;
  tokenStart = ++position;
  return kind;
}

void MAYA_Lex::SkipHarmless() {
  if (position > end_) return;
  SkipWhiteSpace();
  if (scan::IsAny(*position, scan::kKeywordStart | scan::kQuote))
    return;  // as a rule the next command begins here
  static const scan::SkipText kSkip = scan::TextSkippers().back().betweenCommands;
  tokenStart = position = kSkip(position, end_, &line);
}

void MAYA_Lex::SkipHarmlessInCommand() {
  static const scan::SkipText kSkip = scan::TextSkippers().back().inCommand;
  tokenStart = position = kSkip(position, end_, &line);
}

std::int32_t MAYA_Lex::SkipCharacters(const char* set) {
  if (position > end_) return 0;
  while (*position != '\0' && std::strchr(set, *position) != nullptr) {
    if (*position == '\n') ++line;
    ++position;
  }
  tokenStart = position;
  return 0;
}

MayaToken MAYA_Lex::ParseQuote() {
  // Deliberate: a backslash is looked at only as the byte before a quote, so that an escaped backslash before
  // a quote keeps the string open. Reading escapes in pairs would end such a string earlier.
  const char* at = position;
  do {
    at = scan::FindQuote(at + 1, end_);
  } while (*at == '"' && at[-1] == '\\');
  position = at;
  if (*at == '\0') FailAtEnd();
  return String;
}

MayaToken MAYA_Lex::ParseComment() {
  if (position[1] == '/') {
    ParseLineComment();
  } else if (position[1] == '*') {
    ParseBlockComment();
  } else {
    FailReading();
  }
  return Comment;
}

void MAYA_Lex::ParseLineComment() {
  // Deliberate: a line comment that the text ends in is an error, and its line end is part of it. Otherwise a
  // scene that was cut off in its last comment would be taken for a complete one.
  while (*position != '\n' && *position != '\r') {
    if (*position == '\0') FailAtEnd();
    ++position;
  }
}

void MAYA_Lex::ParseBlockComment() {
  // Deliberate: after a "*" the byte after it is consumed too, so that in "/***/" the closing pair is missed
  // and the comment runs on. Looking for the plain pair would import text that is a comment today.
  ++position;
  for (;;) {
    ++position;
    if (*position == '\0') FailAtEnd();
    if (*position != '*') continue;
    ++position;
    if (*position == '\0') FailAtEnd();
    if (*position == '/') return;
  }
}

MayaToken MAYA_Lex::ParseOption() {
  ScanWord();
  return Option;
}

MayaToken MAYA_Lex::ParseID() {
  const char first = *position;
  const bool number = scan::IsNumberStart(first);
  if (!number && !scan::IsLetter(first)) FailReading();
  const char* const start = position;
  ScanWord();
  if (number) return Number;
  return KeywordOrIdentifier(std::string_view(start, static_cast<std::size_t>(position - start) + 1));
}

void MAYA_Lex::ScanWord() {
  const char* at = position;
  for (;;) {
    at = scan::FindWordEnd(at, end_);
    // An embedded NUL is part of the word; only the end of the text is not.
    if (*at != '\0') break;
    position = at;
    if (at == end_) FailAtEnd();
    ++at;
  }
  position = at - 1;
}

void MAYA_Lex::ReportError(const char* message) { UtilitySuite7().ShowMessage(G_plugin_idL, message); }

void MAYA_Lex::FailReading() {
  NoteLine(kReadingError, tokenStart);
  ReportError(LocalizedText(kReadingMessage));
  ThrowCode(kReadingError);
}

void MAYA_Lex::FailAtEnd() {
  // The line of the token's beginning: of a string or a comment that is never closed it helps more than the
  // end.
  NoteLine(kUnexpectedEnd, tokenStart);
  ReportError(LocalizedText(kUnexpectedEndMessage));
  ThrowCode(kUnexpectedEnd);
}

// Counts the lines only here, after a failure: `line` leaves out what stands inside strings and comments. A
// line ends as editors see it, with a line feed, a carriage return or both.
void MAYA_Lex::NoteLine(std::int32_t code, const char* at) const {
  const char* place = std::min(at, end_);
  if (place == end_) {  // after the last line that holds something
    while (place != buffer && scan::IsWhiteSpace(place[-1])) --place;
  }
  std::int64_t number = 1;
  for (const char* byte = buffer; byte != place; ++byte) {
    if (*byte == '\n' || (*byte == '\r' && byte[1] != '\n')) ++number;
  }
  HostNoteLine(code, number);
}

}  // namespace mayaimport
