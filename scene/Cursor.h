// A position in the text of a scene, and the functions that move it. Nothing beyond the end is read.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string_view>

namespace scene {

// Where the search for the end of a command stopped.
enum class StopKind {
  End,           // at its ";"
  NextCommand,   // at a command on a line of its own: this one has no ";"
  ConflictMark,  // at a line with the mark of a merge conflict
  StrangeByte,   // at a byte that has no meaning here, or at the "{{" of a template field
  OpenString,    // a string is never closed
  OpenComment,   // a comment has no end
  TextEnd,
};

struct CommandStop {
  StopKind kind;
  std::uint32_t offset;  // of what is named above, at its beginning
};

class Cursor {
 public:
  explicit Cursor(std::string_view text)
      : begin_(text.data()), end_(text.data() + text.size()), at_(text.data()) {}

  bool atEnd() const { return at_ == end_; }
  char Peek(std::size_t ahead = 0) const {
    return ahead < static_cast<std::size_t>(end_ - at_) ? at_[ahead] : '\0';
  }
  std::uint32_t offset() const { return static_cast<std::uint32_t>(at_ - begin_); }
  void Advance(std::size_t bytes) { at_ += bytes; }
  void MoveTo(std::uint32_t offset) { at_ = begin_ + offset; }
  std::string_view From(std::uint32_t start) const {
    return {begin_ + start, static_cast<std::size_t>(at_ - begin_) - start};
  }
  std::string_view rest() const { return {at_, static_cast<std::size_t>(end_ - at_)}; }
  bool StartsWith(std::string_view start) const { return rest().substr(0, start.size()) == start; }
  bool atLineStart() const { return at_ == begin_ || at_[-1] == '\n'; }

  // Moves over white space and comments. A "/*" without an end is skipped up to the next line that begins
  // with a command, and its offset is put into *openComment, else kNone.
  static constexpr std::uint32_t kNone = 0xffffffff;
  void SkipBlank(std::uint32_t* openComment);

  // Moves over a word and returns it.
  std::string_view TakeWord();

  // Moves over a string, from its opening quote, and returns what stands between the quotes, escapes as they
  // are. *closed is false when the string has no end: then the cursor is where reading can go on, which is
  // the next command or the end of the text. *escaped is false only when there is no backslash in it.
  std::string_view TakeString(bool* closed, bool* escaped);

  static constexpr std::uint32_t kMarkLength = 7;  // of "<<<<<<<"

  void SkipLine();  // moves over the rest of the line and its line feed

  bool AtConflictMark() const;  // whether the line that begins here is the mark of a merge conflict

  // Whether a known command begins here, with nothing but blanks before it on its line.
  bool AtCommandOnItsOwnLine() const;

  // Moves to the end of the command, or to what shows that it has none. Skips strings and comments. With
  // `strange`, stops at strange bytes too. After an open string or comment the cursor is where reading can go
  // on: at the next command.
  CommandStop FindCommandEnd(bool strange);

 private:
  bool AtComment() const { return *at_ == '/' && (Peek(1) == '/' || Peek(1) == '*'); }
  bool CommandAt(const char* at) const;
  bool ClosesString(const char* quote) const;
  const char* FindQuote(const char* at) const;
  bool SkipComment(std::uint32_t* openComment);
  const char* FindPause(bool strange) const;

  const char* begin_;
  const char* end_;
  const char* at_;
  bool noCommentEnd_ = false;  // no "*/" follows
};

}  // namespace scene
