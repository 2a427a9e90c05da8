#include "check/ReadingEnd.h"

namespace check {
namespace {

bool IsSpace(char c) { return c == ' ' || c == '\t' || c == '\r' || c == '\n'; }
bool IsLetter(char c) { return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z'); }
bool IsNumberStart(char c) { return (c >= '0' && c <= '9') || c == '-' || c == '.'; }
bool EndsWord(char c) { return IsSpace(c) || c == ';'; }
bool IsTokenByItself(char c) { return c == '(' || c == ')' || c == '+' || c == ':'; }

class Walk {
 public:
  explicit Walk(std::string_view text) : text_(text) {}

  ReadingEnd Run() {
    while (Step()) {
    }
    end_.offset = token_;
    return end_;
  }

 private:
  using Kind = ReadingEnd::Kind;

  char At(std::size_t at) const { return at < text_.size() ? text_[at] : '\0'; }

  // Over one token. False where the reading ends.
  bool Step() {
    while (at_ < text_.size() && IsSpace(text_[at_])) ++at_;
    token_ = at_;
    if (at_ >= text_.size()) return false;
    const char c = text_[at_];
    if (c == '\0') return Ends(Kind::Nul);
    if (c == '/') return Comment();
    if (c == ';') {
      end_.insideCommand = false;
      ++at_;
      return true;
    }
    if (!end_.insideCommand) end_.command = at_;
    end_.insideCommand = true;
    if (c == '"') return String();
    const bool word = IsLetter(c) ||
                      (IsNumberStart(c) && (c != '-' || IsLetter(At(at_ + 1)) || IsNumberStart(At(at_ + 1))));
    if (word) return Word();
    if (!IsTokenByItself(c) && c != '-') return Ends(Kind::RefusedByte);
    ++at_;
    return true;
  }

  bool Ends(Kind kind) {
    end_.kind = kind;
    return false;
  }

  bool Word() {
    while (at_ < text_.size() && !EndsWord(text_[at_])) ++at_;
    return at_ < text_.size() || Ends(Kind::OpenWord);
  }

  // A backslash is looked at only as the byte before a quote.
  bool String() {
    for (++at_; At(at_) != '\0'; ++at_) {
      if (text_[at_] != '"' || text_[at_ - 1] == '\\') continue;
      ++at_;
      return true;
    }
    return Ends(Kind::OpenString);
  }

  bool Comment() {
    if (At(at_ + 1) == '/') {
      while (At(at_) != '\0' && At(at_) != '\n' && At(at_) != '\r') ++at_;
      return At(at_++) != '\0' || Ends(Kind::LastComment);
    }
    if (At(at_ + 1) != '*') return Ends(Kind::RefusedByte);
    // The byte after a "*" is passed over with it.
    for (at_ += 2; At(at_) != '\0'; ++at_) {
      if (text_[at_] != '*') continue;
      ++at_;
      if (At(at_) == '\0') break;
      if (text_[at_] != '/') continue;
      ++at_;
      return true;
    }
    return Ends(Kind::OpenComment);
  }

  std::string_view text_;
  std::size_t at_ = 0;
  std::size_t token_ = 0;  // where the token begins
  ReadingEnd end_;
};

}  // namespace

ReadingEnd FindReadingEnd(std::string_view text) { return Walk(text).Run(); }

}  // namespace check
