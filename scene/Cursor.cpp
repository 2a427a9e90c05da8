#include "scene/Cursor.h"

#include <algorithm>
#include <iterator>

#include "scan/FindAnyOf.h"
#include "scene/ByteClasses.h"

namespace scene {
namespace {

using scan::FindAnyOf;

// The commands of a scene. One of them at the start of a line begins a new command, even where the last one
// has not ended.
constexpr std::string_view kCommands[] = {
    "addAttr", "applyMetadata", "connectAttr",  "createNode", "currentUnit", "dataStructure",
    "file",    "fileInfo",      "lockNode",     "namespace",  "parent",      "disconnectAttr",
    "rename",  "requires",      "relationship", "select",     "setAttr",
};

constexpr std::size_t kShortestCommand = 4;

// A line that begins with a number, or with fewer letters than any command has, is neither a command nor a
// conflict mark. Most lines of a large scene do: the points, edges and faces of its meshes.
bool IsLineOfData(const char* at, const char* end) {
  while (at != end && (*at == '\t' || *at == ' ')) ++at;
  if (at == end) return false;
  if (!IsByte(*at, kLetterByte)) return IsByte(*at, kDigitByte) || *at == '-' || *at == '.';
  for (std::size_t letters = 1; letters < kShortestCommand; ++letters) {
    if (++at == end) return false;
    if (!IsByte(*at, kLetterByte)) return true;
  }
  return false;
}

constexpr std::string_view kConflictMarks[] = {"<<<<<<<", "=======", ">>>>>>>", "|||||||"};

}  // namespace

void Cursor::SkipBlank(std::uint32_t* openComment) {
  *openComment = kNone;
  while (at_ != end_) {
    if (IsByte(*at_, kSpaceByte)) {
      ++at_;
    } else if (*at_ != '/' || !SkipComment(openComment)) {
      return;
    }
  }
}

// False where no comment begins.
bool Cursor::SkipComment(std::uint32_t* openComment) {
  if (Peek(1) == '/') {
    at_ = FindAnyOf<'\n', '\r'>(at_, end_);
    return true;
  }
  if (Peek(1) != '*') return false;
  const std::size_t left = static_cast<std::size_t>(end_ - at_);
  const std::string_view inside(at_ + 2, left - 2);
  const std::size_t length = noCommentEnd_ ? std::string_view::npos : inside.find("*/");
  if (length != std::string_view::npos) {
    at_ += 2 + length + 2;
    return true;
  }
  noCommentEnd_ = true;
  if (*openComment == kNone) *openComment = offset();
  do {
    SkipLine();
  } while (at_ != end_ && !CommandAt(at_));
  return true;
}

std::string_view Cursor::TakeWord() {
  const char* const start = at_;
  while (at_ != end_ && IsByte(*at_, kWordByte) && !AtComment()) ++at_;
  return {start, static_cast<std::size_t>(at_ - start)};
}

std::string_view Cursor::TakeString(bool* closed, bool* escaped) {
  const char* const start = ++at_;
  *closed = true;
  *escaped = false;
  for (;;) {
    at_ = FindAnyOf<'"', '\\', '\n'>(at_, end_);
    if (at_ == end_) break;
    if (*at_ == '"') {
      const std::string_view text(start, static_cast<std::size_t>(at_ - start));
      ++at_;
      return text;
    }
    if (*at_ == '\\') {
      *escaped = true;
      at_ += std::min<std::ptrdiff_t>(2, end_ - at_);
      if (at_[-1] != '\n') continue;
    } else {
      ++at_;
    }
    // A line that begins like a command: either the string has several lines, or it was left open. The next
    // quote decides: it closes a string in the first case and opens one in the second.
    if (!CommandAt(at_)) continue;
    const char* const quote = FindQuote(at_);
    if (quote == end_ || !ClosesString(quote)) break;
    *escaped = true;  // possibly: what was skipped is not examined
    at_ = quote;
  }
  *closed = false;
  return {start, static_cast<std::size_t>(at_ - start)};
}

// The next quote without a backslash before it, or the end.
const char* Cursor::FindQuote(const char* at) const {
  for (;;) {
    at = FindAnyOf<'"', '\\'>(at, end_);
    if (at == end_ || *at == '"') return at;
    at += std::min<std::ptrdiff_t>(2, end_ - at);
  }
}

// Whether the quote looks like the end of a string rather than the beginning of one.
bool Cursor::ClosesString(const char* quote) const {
  const char* const next = quote + 1;
  return next == end_ || *next == ';' || *next == ',' || *next == ')' || *next == '}' ||
         IsByte(*next, kSpaceByte);
}

void Cursor::SkipLine() {
  at_ = FindAnyOf<'\n'>(at_, end_);
  if (at_ != end_) ++at_;
}

bool Cursor::AtConflictMark() const {
  const char first = Peek();
  if ((first != '<' && first != '=' && first != '>' && first != '|') || !atLineStart()) return false;
  const std::string_view start = rest().substr(0, kMarkLength);
  if (std::find(std::begin(kConflictMarks), std::end(kConflictMarks), start) == std::end(kConflictMarks))
    return false;
  const char next = Peek(kMarkLength);
  return next == '\0' || IsByte(next, kSpaceByte);
}

bool Cursor::AtCommandOnItsOwnLine() const {
  const char* before = at_;
  while (before != begin_ && (before[-1] == ' ' || before[-1] == '\t')) --before;
  return (before == begin_ || before[-1] == '\n' || before[-1] == '\r') && CommandAt(at_);
}

bool Cursor::CommandAt(const char* at) const {
  while (at != end_ && (*at == '\t' || *at == ' ')) ++at;
  if (at == end_ || !IsByte(*at, kLetterByte)) return false;
  const char* const start = at;
  while (at != end_ && IsByte(*at, kLetterByte)) ++at;
  if (at == end_ || !IsByte(*at, kSpaceByte)) return false;
  const std::string_view word(start, static_cast<std::size_t>(at - start));
  if (word.size() < kShortestCommand) return false;
  return std::find(std::begin(kCommands), std::end(kCommands), word) != std::end(kCommands);
}

const char* Cursor::FindPause(bool strange) const {
  if (!strange) {
    return FindAnyOf<';', '"', '/', '\n'>(
        at_, end_, [this](const char* found) { return *found != '\n' || !IsLineOfData(found + 1, end_); });
  }
  const char* at = at_;
  while (at != end_ && !IsByte(*at, kPauseByte | kStrangeByte | kBraceByte)) ++at;
  return at;
}

CommandStop Cursor::FindCommandEnd(bool strange) {
  for (;;) {
    at_ = FindPause(strange);
    const std::uint32_t found = offset();
    if (at_ == end_) return {StopKind::TextEnd, found};
    switch (*at_) {
      case ';':
        return {StopKind::End, found};
      case '"': {
        bool closed = false;
        bool escaped = false;
        (void)TakeString(&closed, &escaped);
        if (!closed) return {StopKind::OpenString, found};
        break;
      }
      case '\n':
        ++at_;
        if (AtConflictMark()) return {StopKind::ConflictMark, offset()};
        if (CommandAt(at_)) return {StopKind::NextCommand, offset()};
        break;
      case '/': {
        std::uint32_t openComment = kNone;
        if (!SkipComment(&openComment)) ++at_;
        if (openComment != kNone) return {StopKind::OpenComment, openComment};
        break;
      }
      case '{':
        if (Peek(1) == '{') return {StopKind::StrangeByte, found};
        ++at_;
        break;
      default:
        return {StopKind::StrangeByte, found};
    }
  }
}

}  // namespace scene
