#include "tools/mayascene/TerminalText.h"

#include <unistd.h>

#include <array>
#include <cstddef>
#include <cstdio>
#include <cstdlib>

#include "refhost/ShownText.h"

namespace mayascene {
namespace {

struct Character {
  std::size_t length;
  char32_t point;
};

// The character at the index of a text that is valid UTF-8.
Character characterAt(std::string_view text, std::size_t index) {
  const auto first = static_cast<unsigned char>(text[index]);
  const std::size_t length = first < 0x80 ? 1 : first < 0xe0 ? 2 : first < 0xf0 ? 3 : 4;
  char32_t point = length == 1 ? first : first & (0x7fu >> length);
  for (std::size_t i = 1; i < length; ++i) {
    point = (point << 6) | (static_cast<unsigned char>(text[index + i]) & 0x3fu);
  }
  return {length, point};
}

// Controls of both sets, and the invisible characters that change the order or the lines of what is shown.
bool harmfulOnTerminal(char32_t point) {
  return point < 0x20 || (point >= 0x7f && point < 0xa0) || point == 0x61c ||
         (point >= 0x200b && point <= 0x200f) || (point >= 0x2028 && point <= 0x202e) ||
         (point >= 0x2060 && point <= 0x206f) || point == 0xfeff || (point >= 0xfff9 && point <= 0xfffb);
}

std::string escaped(char32_t point) {
  if (point == '\n') return "\\n";
  if (point == '\r') return "\\r";
  if (point == '\t') return "\\t";
  std::array<char, 12> text{};
  (void)std::snprintf(text.data(), text.size(), point < 0x80 ? "\\x%02x" : "\\u%04x",
                      static_cast<unsigned>(point));
  return text.data();
}

}  // namespace

std::string terminalText(std::string_view bytes) {
  const std::string valid = refhost::shownText(bytes);
  std::string text;
  text.reserve(valid.size());
  for (std::size_t i = 0; i < valid.size();) {
    const Character character = characterAt(valid, i);
    if (harmfulOnTerminal(character.point)) {
      text += escaped(character.point);
    } else {
      text.append(valid, i, character.length);
    }
    i += character.length;
  }
  return text;
}

std::string quotedTerminalText(std::string_view bytes) { return '"' + terminalText(bytes) + '"'; }

bool colourAllowed(int descriptor) {
  if (std::getenv("NO_COLOR") != nullptr) return false;
  const char* terminal = std::getenv("TERM");
  if (terminal == nullptr || std::string_view(terminal) == "dumb") return false;
  return isatty(descriptor) == 1;
}

std::string Style::wrap(std::string_view code, std::string_view text) const {
  if (!colour_) return std::string(text);
  return "\x1b[" + std::string(code) + 'm' + std::string(text) + "\x1b[0m";
}

}  // namespace mayascene
