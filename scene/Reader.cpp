#include "scene/Reader.h"

#include <algorithm>
#include <cstddef>
#include <iterator>
#include <limits>
#include <string>

#include "scene/ByteClasses.h"
#include "scene/TemplateField.h"
#include "scene/Text.h"

namespace scene {
namespace {

using diag::Code;

// No more arguments of one command are kept: no command that is read in this way has more.
constexpr std::size_t kMostArguments = 10000;

// The length in bytes of the character at the front of the text, which need not be valid UTF-8.
std::size_t CharacterLength(std::string_view text) {
  std::size_t length = 1;
  if ((static_cast<unsigned char>(text[0]) & 0xc0) != 0xc0) return length;
  while (length < std::min<std::size_t>(4, text.size()) &&
         (static_cast<unsigned char>(text[length]) & 0xc0) == 0x80) {
    ++length;
  }
  return length;
}

}  // namespace

const Reader::CommandReader Reader::kReaders[] = {
    {"setAttr", &Reader::ReadSetAttr},
    {"createNode", &Reader::ReadCreateNode},
    {"connectAttr", &Reader::ReadConnectAttr},
    {"rename", &Reader::ReadRename},
    {"addAttr", &Reader::ReadAddAttr},
    {"select", &Reader::ReadSelect},
    {"parent", &Reader::ReadParent},
    {"disconnectAttr", &Reader::ReadDisconnectAttr},
    {"requires", &Reader::ReadRequires},
    {"fileInfo", &Reader::ReadFileInfo},
    {"file", &Reader::ReadFile},
    {"currentUnit", &Reader::ReadCurrentUnit},
    {"namespace", &Reader::ReadNamespace},
};

const Reader::CommandReader* Reader::FindReader(std::string_view name) {
  const auto* const found = std::find_if(std::begin(kReaders), std::end(kReaders),
                                         [name](const auto& entry) { return entry.name == name; });
  return found == std::end(kReaders) ? nullptr : found;
}

Reader::Reader(std::string_view text, diag::Collector* diagnostics, std::vector<NodeNote>* notes)
    : diagnostics_(diagnostics), cursor_(text), builder_(text, diagnostics, notes) {}

Scene Reader::Read() {
  constexpr std::string_view kByteOrderMark = "\xef\xbb\xbf";
  if (cursor_.StartsWith(kByteOrderMark)) cursor_.Advance(kByteOrderMark.size());
  while (!cursor_.atEnd()) ReadCommand();
  return builder_.Finish();
}

void Reader::ReadCommand() {
  std::uint32_t openComment = 0;
  cursor_.SkipBlank(&openComment);
  if (openComment != Cursor::kNone) diagnostics_->Report(Code::OpenComment, {openComment, 2});
  if (cursor_.atEnd()) return;
  commandOffset_ = cursor_.offset();
  command_ = {};
  if (cursor_.AtConflictMark()) {
    cursor_.SkipLine();
    const std::string_view line = cursor_.From(commandOffset_);
    diagnostics_->Report(Code::ConflictMark, {commandOffset_, line.find_last_not_of("\r\n") + 1});
    return;
  }
  if (cursor_.Peek() == ';') return cursor_.Advance(1);
  if (!IsByte(cursor_.Peek(), kLetterByte)) {
    (void)StrangeByte();
    return;
  }
  command_ = cursor_.TakeWord();
  if (const CommandReader* const reader = FindReader(command_)) return (this->*reader->read)();
  std::uint32_t end = 0;
  (void)FindEnd(false, &end);
}

// ---- tokens ----

// Reports, and skips the rest of the command.
Reader::Token Reader::Broken(Code code, std::uint32_t offset, std::uint32_t end) {
  diagnostics_->Report(code, {offset, end - offset});
  SkipCommand();
  return {};
}

Reader::Token Reader::StrangeByte() {
  const std::string_view rest = cursor_.rest();
  const std::size_t field = TemplateFieldLength(rest);
  const std::size_t length = field != 0 ? field : CharacterLength(rest);
  const Code code = field != 0 ? Code::TemplateField : Code::UnexpectedByte;
  diagnostics_->Report(code, {cursor_.offset(), length}, {rest.substr(0, length)});
  cursor_.Advance(length);
  SkipCommand();
  return {};
}

Reader::Token Reader::StringToken() {
  const std::uint32_t quote = cursor_.offset();
  bool closed = false;
  bool escaped = false;
  const std::string_view inside = cursor_.TakeString(&closed, &escaped);
  if (!closed) {
    diagnostics_->Report(Code::OpenString, {quote, 1});
    return {};
  }
  const std::string_view text = escaped ? builder_.Keep(Unescaped(inside)) : inside;
  return {TokenKind::String, text, quote + 1, cursor_.offset() - 1};
}

Reader::Token Reader::NextToken() {
  std::uint32_t openComment = 0;
  cursor_.SkipBlank(&openComment);
  if (openComment != Cursor::kNone) diagnostics_->Report(Code::OpenComment, {openComment, 2});
  const std::uint32_t offset = cursor_.offset();
  if (cursor_.atEnd()) {
    diagnostics_->Report(Code::CommandCutOff, {commandOffset_, command_.size()}, {command_});
    return {};
  }
  if (cursor_.AtConflictMark()) return Broken(Code::ConflictMark, offset, offset + Cursor::kMarkLength);
  const char first = cursor_.Peek();
  if (first == ';') {
    cursor_.Advance(1);
    return {TokenKind::End, {}, offset, offset + 1};
  }
  if (first == '"') return StringToken();
  if (IsByte(first, kPunctuationByte) || (first == '{' && cursor_.Peek(1) != '{')) {
    cursor_.Advance(1);
    return {TokenKind::Punctuation, cursor_.From(offset), offset, offset + 1};
  }
  if (!IsByte(first, kWordByte)) return StrangeByte();
  if (cursor_.AtCommandOnItsOwnLine()) {
    diagnostics_->Report(Code::CommandWithoutEnd, {commandOffset_, command_.size()}, {command_});
    return {};
  }
  const bool option = first == '-' && IsByte(cursor_.Peek(1), kLetterByte);
  const std::string_view word = cursor_.TakeWord();
  return {option ? TokenKind::Option : TokenKind::Word, word, offset, cursor_.offset()};
}

bool Reader::ReadArguments() {
  arguments_.clear();
  for (;;) {
    const Token token = NextToken();
    if (token.kind == TokenKind::End) return true;
    if (token.kind == TokenKind::Broken) return false;
    if (arguments_.size() < kMostArguments) arguments_.push_back(token);
  }
}

bool Reader::FindEnd(bool strange, std::uint32_t* end) {
  const CommandStop stop = cursor_.FindCommandEnd(strange);
  switch (stop.kind) {
    case StopKind::End:
      *end = stop.offset;
      cursor_.Advance(1);
      return true;
    case StopKind::NextCommand:
      diagnostics_->Report(Code::CommandWithoutEnd, {commandOffset_, command_.size()}, {command_});
      return false;
    case StopKind::ConflictMark:
      (void)Broken(Code::ConflictMark, stop.offset, stop.offset + Cursor::kMarkLength);
      return false;
    case StopKind::StrangeByte:
      (void)StrangeByte();
      return false;
    case StopKind::OpenString:
      diagnostics_->Report(Code::OpenString, {stop.offset, 1});
      return false;
    case StopKind::OpenComment:
      diagnostics_->Report(Code::OpenComment, {stop.offset, 2});
      return false;
    default:
      diagnostics_->Report(Code::CommandCutOff, {commandOffset_, command_.size()}, {command_});
      return false;
  }
}

void Reader::SkipCommand() {
  for (;;) {
    switch (cursor_.FindCommandEnd(false).kind) {
      case StopKind::End:
        return cursor_.Advance(1);
      case StopKind::ConflictMark:
        cursor_.SkipLine();
        // Steps back before the line feed: the next line may begin with a command.
        if (cursor_.atLineStart()) cursor_.MoveTo(cursor_.offset() - 1);
        break;
      default:
        return;
    }
  }
}

void Reader::Lacks(std::string_view what) {
  diagnostics_->Report(Code::IncompleteCommand, {commandOffset_, command_.size()}, {command_, what});
}

bool Reader::Is(const Token& token, std::string_view shortName, std::string_view longName) {
  if (token.kind != TokenKind::Option) return false;
  const std::string_view name = token.text.substr(1);
  return name == shortName || name == longName;
}

bool Reader::IsValue(const Token& token) {
  return token.kind == TokenKind::String || token.kind == TokenKind::Word;
}

Reader::Named Reader::NameOf(const Token& token) {
  return {token.text, {token.offset, token.end - token.offset}};
}

Scene Read(std::string_view text, diag::Collector& diagnostics) { return Read(text, diagnostics, nullptr); }

Scene Read(std::string_view text, diag::Collector& diagnostics, std::vector<NodeNote>* notes) {
  if (text.size() >= std::numeric_limits<std::uint32_t>::max()) {
    diagnostics.Report(Code::TextTooLong, {}, {std::to_string(text.size())});
    text = {};
  }
  return Reader(text, &diagnostics, notes).Read();
}

}  // namespace scene
