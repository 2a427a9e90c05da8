#include "diag/ShownText.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <cstdio>

#include "text/Utf8.h"

namespace diag {
namespace {

// Controls of both sets, and the invisible characters that change the order or the lines of what is shown.
bool Harmful(char32_t point) {
  return point < 0x20 || (point >= 0x7f && point < 0xa0) || point == 0x61c ||
         (point >= 0x200b && point <= 0x200f) || (point >= 0x2028 && point <= 0x202e) ||
         (point >= 0x2060 && point <= 0x206f) || point == 0xfeff || (point >= 0xfff9 && point <= 0xfffb);
}

std::string Escaped(const char* form, unsigned number) {
  std::array<char, 12> text{};
  (void)std::snprintf(text.data(), text.size(), form, number);
  return text.data();
}

std::string Escaped(char32_t point) {
  if (point == '\n') return "\\n";
  if (point == '\r') return "\\r";
  if (point == '\t') return "\\t";
  return Escaped(point < 0x80 ? "\\x%02x" : "\\u%04x", static_cast<unsigned>(point));
}

}  // namespace

std::string ShownText(std::string_view bytes) {
  std::string shown;
  shown.reserve(bytes.size());
  for (std::size_t at = 0; at < bytes.size();) {
    const text::Character character = text::CharacterAt(bytes, at);
    if (character.length == 0) {
      shown += Escaped("\\x%02x", static_cast<std::uint8_t>(bytes[at]));
      ++at;
      continue;
    }
    if (Harmful(character.point)) {
      shown += Escaped(character.point);
    } else {
      shown.append(bytes, at, character.length);
    }
    at += character.length;
  }
  return shown;
}

}  // namespace diag
