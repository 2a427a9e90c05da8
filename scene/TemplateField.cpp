#include "scene/TemplateField.h"

#include <algorithm>

#include "scene/ByteClasses.h"

namespace scene {
namespace {

// A longer one is not taken for a field.
constexpr std::size_t kLongestField = 60;

}  // namespace

std::size_t TemplateFieldLength(std::string_view text) {
  const auto closed = [text](std::size_t open, std::string_view close) -> std::size_t {
    const std::size_t end = text.find(close, open);
    if (end == std::string_view::npos || end == open) return 0;
    const std::string_view inside = text.substr(open, end - open);
    const bool plain =
        std::all_of(inside.begin(), inside.end(), [](char c) { return IsByte(c, kWordByte) || c == ' '; });
    return plain ? end + close.size() : 0;
  };
  text = text.substr(0, kLongestField);
  if (text.substr(0, 2) == "{{") return closed(2, "}}");
  if (text.substr(0, 2) == "${") return closed(2, "}");
  if (text[0] == '<') return closed(1, ">");
  if (text[0] == '%' || text[0] == '@') return closed(1, text.substr(0, 1));
  if (text[0] != '$' || text.size() < 2 || !IsByte(text[1], kLetterByte)) return 0;
  std::size_t end = 1;
  while (end < text.size() && IsByte(text[end], kLetterByte | kDigitByte)) ++end;
  return end;
}

}  // namespace scene
