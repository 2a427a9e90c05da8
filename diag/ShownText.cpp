#include "diag/ShownText.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <cstdio>

namespace diag {
namespace {

// A code point and its length in bytes; a length of 0 where the bytes are no valid UTF-8.
struct Character {
  std::size_t length;
  char32_t point;
};

std::uint8_t ByteAt(std::string_view text, std::size_t at) { return static_cast<std::uint8_t>(text[at]); }

Character CharacterAt(std::string_view text, std::size_t at) {
  constexpr Character kInvalid{0, 0};
  constexpr char32_t kSmallest[] = {0, 0, 0x80, 0x800, 0x10000};
  const std::uint8_t first = ByteAt(text, at);
  if (first < 0x80) return {1, first};
  const std::size_t length = first < 0xc2 ? 0 : first < 0xe0 ? 2 : first < 0xf0 ? 3 : first < 0xf5 ? 4 : 0;
  if (length == 0 || length > text.size() - at) return kInvalid;
  char32_t point = first & (0x7fu >> length);
  for (std::size_t i = 1; i < length; ++i) {
    const std::uint8_t byte = ByteAt(text, at + i);
    if ((byte & 0xc0) != 0x80) return kInvalid;
    point = (point << 6) | (byte & 0x3fu);
  }
  const bool surrogate = point >= 0xd800 && point < 0xe000;
  if (point < kSmallest[length] || point > 0x10ffff || surrogate) return kInvalid;
  return {length, point};
}

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
  std::string text;
  text.reserve(bytes.size());
  for (std::size_t at = 0; at < bytes.size();) {
    const Character character = CharacterAt(bytes, at);
    if (character.length == 0) {
      text += Escaped("\\x%02x", ByteAt(bytes, at));
      ++at;
      continue;
    }
    if (Harmful(character.point)) {
      text += Escaped(character.point);
    } else {
      text.append(bytes, at, character.length);
    }
    at += character.length;
  }
  return text;
}

}  // namespace diag
