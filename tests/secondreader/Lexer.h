// Cuts a scene text into tokens, one byte at a time.
#pragma once

#include <array>
#include <cstddef>
#include <functional>
#include <string_view>

namespace secondreader {

enum class Kind {
  Unknown,
  Comment,
  File,
  Requires,
  CreateNode,
  SetAttr,
  AddAttr,
  Parent,
  ConnectAttr,
  DisconnectAttr,
  Select,
  CurrentUnit,
  Identifier,
  Number,
  OpenParen,
  CloseParen,
  Plus,
  Option,
  String,
  Semicolon,
  Colon,
  EndOfFile,
};

struct Token {
  Kind kind = Kind::Unknown;
  std::string_view text;
};

struct Keyword {
  std::string_view word;
  Kind kind;
};
inline constexpr std::array<Keyword, 10> kKeywords = {{
    {"file", Kind::File},
    {"requires", Kind::Requires},
    {"createnode", Kind::CreateNode},
    {"setattr", Kind::SetAttr},
    {"addattr", Kind::AddAttr},
    {"parent", Kind::Parent},
    {"connectattr", Kind::ConnectAttr},
    {"disconnectattr", Kind::DisconnectAttr},
    {"select", Kind::Select},
    {"currentunit", Kind::CurrentUnit},
}};

// The messages that a lexical error shows, by their number in the table of localised strings.
inline constexpr int kReadingMessage = 3;
inline constexpr int kEndMessage = 4;

class Lexer {
 public:
  // The text outlives the lexer. `show` puts a message before the user.
  Lexer(std::string_view text, std::function<void(int)> show) : text_(text), show_(std::move(show)) {}

  // The next token. Throws the code of a lexical error after showing its message.
  Token next();

  // For a text that ends where it may not: shows the message and throws.
  [[noreturn]] void failAtEnd();

 private:
  // The byte there; NUL at the end of the text and after it.
  char at(std::size_t place) const { return place < text_.size() ? text_[place] : '\0'; }
  [[noreturn]] void failAtByte();

  Token token(Kind kind, std::size_t end);
  Token quote();
  Token comment();
  Token word();
  std::size_t wordEnd(std::size_t place);

  std::string_view text_;
  std::function<void(int)> show_;
  std::size_t place_ = 0;
  bool ended_ = false;
};

}  // namespace secondreader
