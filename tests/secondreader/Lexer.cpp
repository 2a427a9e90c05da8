#include "tests/secondreader/Lexer.h"

#include "hostapi/ErrorCodes.h"
#include "tests/secondreader/Words.h"

namespace secondreader {
namespace {

bool isLetter(char byte) { return (byte >= 'a' && byte <= 'z') || (byte >= 'A' && byte <= 'Z'); }
bool isDigit(char byte) { return byte >= '0' && byte <= '9'; }
bool isWhite(char byte) { return byte == '\t' || byte == '\r' || byte == '\n' || byte == ' '; }

}  // namespace

void Lexer::failAtEnd() {
  show_(kEndMessage);
  throw int{HOST_ERR_MAYA_UNEXPECTED_END};
}

void Lexer::failAtByte() {
  show_(kReadingMessage);
  throw int{HOST_ERR_MAYA_SYNTAX};
}

Token Lexer::token(Kind kind, std::size_t end) {
  const Token made{kind, text_.substr(place_, end - place_)};
  place_ = end;
  return made;
}

Token Lexer::next() {
  if (ended_) return {Kind::EndOfFile, {}};
  while (isWhite(at(place_))) ++place_;
  const char second = at(place_ + 1);
  switch (at(place_)) {
    case '\0':
      ended_ = true;
      return {Kind::EndOfFile, {}};
    case '"':
      return quote();
    case '/':
      return comment();
    case '(':
      return token(Kind::OpenParen, place_ + 1);
    case ')':
      return token(Kind::CloseParen, place_ + 1);
    case '+':
      return token(Kind::Plus, place_ + 1);
    case ';':
      return token(Kind::Semicolon, place_ + 1);
    case ':':
      return token(Kind::Colon, place_ + 1);
    case '-':
      if (isLetter(second)) return token(Kind::Option, wordEnd(place_));
      if (isDigit(second) || second == '-' || second == '.') return word();
      return token(Kind::Unknown, place_ + 1);
    default:
      return word();
  }
}

// After the last byte of the word; a word that the text ends in is an error.
std::size_t Lexer::wordEnd(std::size_t place) {
  while (place < text_.size() && !isWhite(text_[place]) && text_[place] != ';') ++place;
  if (place == text_.size()) failAtEnd();
  return place;
}

Token Lexer::word() {
  constexpr std::size_t kLongestCompared = 255;
  const char first = at(place_);
  if (!isLetter(first) && !isDigit(first) && first != '-' && first != '.') failAtByte();
  const std::size_t end = wordEnd(place_);
  if (!isLetter(first)) return token(Kind::Number, end);
  const std::string_view text = text_.substr(place_, end - place_);
  if (text.size() <= kLongestCompared) {
    for (const Keyword& keyword : kKeywords) {
      if (same(text, keyword.word)) return token(keyword.kind, end);
    }
  }
  return token(Kind::Identifier, end);
}

Token Lexer::quote() {
  std::size_t place = place_ + 1;
  for (;; ++place) {
    if (at(place) == '\0') failAtEnd();
    if (at(place) == '"' && at(place - 1) != '\\') return token(Kind::String, place + 1);
  }
}

Token Lexer::comment() {
  std::size_t place = place_ + 2;
  if (at(place_ + 1) == '/') {
    while (at(place) != '\n' && at(place) != '\r') {
      if (at(place) == '\0') failAtEnd();
      ++place;
    }
    return token(Kind::Comment, place + 1);
  }
  if (at(place_ + 1) != '*') failAtByte();
  for (;;) {
    const char byte = at(place++);
    if (byte == '\0') failAtEnd();
    if (byte != '*') continue;
    const char next = at(place++);
    if (next == '/') return token(Kind::Comment, place);
    if (next == '\0') failAtEnd();
  }
}

}  // namespace secondreader
