// Why the import stopped, and where: in the text. What stops it at the keys of a node is in KeyCounts.cpp.
#include <algorithm>
#include <cstddef>
#include <string>

#include "check/ReadingEnd.h"
#include "check/RulesInternal.h"
#include "scene/TemplateField.h"
#include "text/Utf8.h"

namespace check {
namespace {

using diag::Code;
using diag::Range;

// The line without its end, counted as the import does: a carriage return alone ends a line too. Empty for a
// line that the text does not have.
Range LineOf(std::string_view text, std::uint64_t line) {
  std::size_t start = 0;
  for (; line > 1; --line) {
    const std::size_t end = text.find_first_of("\r\n", start);
    if (end == std::string_view::npos) return {text.size(), 0};
    start = end + (text.substr(end, 2) == "\r\n" ? 2 : 1);
  }
  return {start, std::min(text.find_first_of("\r\n", start), text.size()) - start};
}

std::string_view RestOfLine(std::string_view text, std::size_t at) {
  return text.substr(at, std::min(text.find_first_of("\r\n", at), text.size()) - at);
}

// The bytes of the character that begins the text; one where it begins with none.
std::size_t CharacterLength(std::string_view text) {
  return std::max<std::size_t>(1, text::CharacterAt(text, 0).length);
}

bool IsConflictMark(std::string_view text, std::size_t at) {
  if (at != 0 && text[at - 1] != '\n' && text[at - 1] != '\r') return false;
  const std::string_view start = text.substr(at, 7);
  return start == "<<<<<<<" || start == "=======" || start == ">>>>>>>" || start == "|||||||";
}

void ReportRefusedByte(std::string_view text, const ReadingEnd& end, diag::Collector* diagnostics) {
  const std::size_t at = end.offset;
  const std::string_view line = RestOfLine(text, at);
  if (IsConflictMark(text, at)) return diagnostics->Report(Code::ConflictMarkStops, {at, line.size()});
  if (const std::size_t length = scene::TemplateFieldLength(line); length != 0) {
    return diagnostics->Report(Code::TemplateFieldStops, {at, length}, {line.substr(0, length)});
  }
  if (line[0] == '|') {
    const std::size_t length = std::min(line.find_first_of(" \t;"), line.size());
    return diagnostics->Report(Code::UnquotedPath, {at, length}, {line.substr(0, length)});
  }
  const std::string_view before = text.substr(end.command, at - end.command);
  if (line[0] == '{' && before.find("attributeAlias") != std::string_view::npos) {
    const std::size_t close = line.find('}');
    return diagnostics->Report(Code::AliasList,
                               {at, close == std::string_view::npos ? line.size() : close + 1});
  }
  const std::size_t length = CharacterLength(text.substr(at));
  diagnostics->Report(Code::RefusedByte, {at, length}, {text.substr(at, length)});
}

void ReportUnexpectedEnd(std::string_view text, const ReadingEnd& end, diag::Collector* diagnostics) {
  switch (end.kind) {
    case ReadingEnd::Kind::OpenString:
      return diagnostics->Report(Code::CutOffInString, {end.offset, RestOfLine(text, end.offset).size()});
    case ReadingEnd::Kind::OpenComment:
      return diagnostics->Report(Code::CutOffInComment, {end.offset, 2});
    case ReadingEnd::Kind::LastComment:
      return diagnostics->Report(Code::LastCommentOpen, {end.offset, RestOfLine(text, end.offset).size()});
    default: {
      const std::size_t begin = end.insideCommand ? end.command : end.offset;
      const std::string_view rest = text.substr(begin);
      const std::string_view name = rest.substr(0, std::min(rest.find_first_of(" \t\r\n;"), rest.size()));
      return diagnostics->Report(Code::CutOffInCommand, {begin, name.size()}, {name});
    }
  }
}

// The importer passes over letters at the end of a number.
std::string_view WithoutLetters(std::string_view word) {
  while (!word.empty() &&
         ((word.back() >= 'a' && word.back() <= 'z') || (word.back() >= 'A' && word.back() <= 'Z'))) {
    word.remove_suffix(1);
  }
  return word;
}

// The first word of the line that should be a number and cannot be read as one; the line where there is none.
Range BadNumberIn(std::string_view text, const Range& line) {
  const auto end = static_cast<std::size_t>(line.offset + line.length);
  for (auto at = static_cast<std::size_t>(line.offset); at < end;) {
    const std::size_t start = text.find_first_not_of(" \t;\r", at);
    if (start >= end) break;
    at = std::min(text.find_first_of(" \t;\r\n", start), end);
    const std::string_view word = text.substr(start, at - start);
    const bool number = word[0] == '-' || word[0] == '.' || (word[0] >= '0' && word[0] <= '9');
    const bool option = word.size() > 1 && word[0] == '-' && WithoutLetters(word.substr(0, 2)).size() == 1;
    if (number && !option && !scene::NumberOf(WithoutLetters(word))) return {start, word.size()};
  }
  return line;
}

void ReportNumber(std::string_view text, const CameOver& cameOver, diag::Collector* diagnostics) {
  const Range range = BadNumberIn(text, LineOf(text, cameOver.line));
  const Code code = cameOver.stop == Stop::LargeNumber ? Code::NumberTooLarge : Code::NumberUnreadable;
  const auto offset = static_cast<std::size_t>(range.offset);
  diagnostics->Report(code, range, {text.substr(offset, static_cast<std::size_t>(range.length))});
}

}  // namespace

void ReportOtherStop(std::string_view text, const CameOver& cameOver, diag::Collector* diagnostics) {
  const Range range = cameOver.line == 0 ? Range{} : LineOf(text, cameOver.line);
  diagnostics->Report(Code::ImportStopped, range, {std::to_string(cameOver.code), cameOver.sentence});
}

void ReportStopInText(std::string_view text, const CameOver& cameOver, diag::Collector* diagnostics) {
  if (cameOver.stop == Stop::LargeNumber || cameOver.stop == Stop::BadNumber) {
    if (cameOver.line == 0) return ReportOtherStop(text, cameOver, diagnostics);
    return ReportNumber(text, cameOver, diagnostics);
  }
  const ReadingEnd end = FindReadingEnd(text);
  const bool refused = end.kind == ReadingEnd::Kind::RefusedByte;
  if (refused != (cameOver.stop == Stop::RefusedByte)) return ReportOtherStop(text, cameOver, diagnostics);
  if (refused) return ReportRefusedByte(text, end, diagnostics);
  ReportUnexpectedEnd(text, end, diagnostics);
}

}  // namespace check
