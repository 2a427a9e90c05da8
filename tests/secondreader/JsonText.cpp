#include "tests/secondreader/JsonText.h"

#include <cstddef>
#include <cstdio>

namespace secondreader {
namespace {

// The character that the text begins with: its length in bytes and its number; length 0 where the bytes are
// not valid UTF-8.
struct Character {
  std::size_t length = 0;
  unsigned long number = 0;
};

// The shortest form for each number is the only valid one.
std::size_t lengthOf(unsigned long number) {
  if (number < 0x80) return 1;
  if (number < 0x800) return 2;
  return number < 0x10000 ? 3 : 4;
}

Character firstOf(std::string_view text) {
  const auto byte = [&](std::size_t place) { return static_cast<unsigned char>(text[place]); };
  Character character;
  if (byte(0) < 0x80) return {1, byte(0)};
  if (byte(0) >= 0xC0 && byte(0) < 0xE0) character = {2, byte(0) - 0xC0ul};
  if (byte(0) >= 0xE0 && byte(0) < 0xF0) character = {3, byte(0) - 0xE0ul};
  if (byte(0) >= 0xF0 && byte(0) < 0xF8) character = {4, byte(0) - 0xF0ul};
  if (character.length == 0 || character.length > text.size()) return {};
  for (std::size_t place = 1; place < character.length; ++place) {
    if (byte(place) < 0x80 || byte(place) >= 0xC0) return {};
    character.number = character.number * 0x40 + (byte(place) - 0x80ul);
  }
  const bool surrogate = character.number >= 0xD800 && character.number <= 0xDFFF;
  const bool valid =
      lengthOf(character.number) == character.length && !surrogate && character.number <= 0x10FFFF;
  return valid ? character : Character{};
}

std::string escaped(unsigned long number) {
  char text[sizeof "\\u0000"];
  (void)std::snprintf(text, sizeof text, "\\u%04x", static_cast<unsigned>(number & 0xFFFF));
  return text;
}

}  // namespace

std::string jsonText(std::string_view bytes) {
  std::string text = "\"";
  while (!bytes.empty()) {
    const auto [length, number] = firstOf(bytes);
    if (length == 0) {
      text += "\xEF\xBF\xBD";  // U+FFFD
    } else if (number < 0x20 || (number >= 0x7F && number < 0xA0)) {
      text += escaped(number);
    } else {
      if (number == '"' || number == '\\') text += '\\';
      text += bytes.substr(0, length);
    }
    bytes.remove_prefix(length == 0 ? 1 : length);
  }
  return text + '"';
}

}  // namespace secondreader
