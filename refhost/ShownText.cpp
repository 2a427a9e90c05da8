#include "refhost/ShownText.h"

#include <cstddef>
#include <cstdint>

#include "hostutil/HostSetup.h"
#include "text/Utf8.h"

namespace refhost {
namespace {

constexpr std::string_view kReplacement = "\xEF\xBF\xBD";  // U+FFFD

unsigned byteAt(std::string_view bytes, std::size_t index) {
  return static_cast<unsigned char>(bytes[index]);
}

void appendEscape(std::string& line, unsigned character) {
  constexpr char kDigits[] = "0123456789abcdef";
  line += "\\u00";
  line += kDigits[character >> 4];
  line += kDigits[character & 0xF];
}

void appendJsonCharacter(std::string& line, std::string_view character) {
  constexpr unsigned kFirstPrintable = 0x20;
  constexpr unsigned kDelete = 0x7F;
  const unsigned first = byteAt(character, 0);
  if (first < kFirstPrintable || first == kDelete) {
    appendEscape(line, first);
  } else if (first == 0xC2 && byteAt(character, 1) < 0xA0) {
    appendEscape(line, byteAt(character, 1));  // U+0080 to U+009F
  } else {
    if (first == '"' || first == '\\') line += '\\';
    line += character;
  }
}

}  // namespace

std::string shownText(std::string_view bytes) { return text::ValidUtf8(bytes); }

std::string shownUnits(const HostUTF16Unit* units) {
  const std::int64_t length = HostUnitsToShownText(units, nullptr, 0);
  std::string text(static_cast<std::size_t>(length) + 1, '\0');
  HostUnitsToShownText(units, text.data(), length + 1);
  text.pop_back();
  return text;
}

void appendJsonText(std::string& line, std::string_view bytes) {
  line += '"';
  for (std::size_t index = 0; index < bytes.size();) {
    const std::size_t length = text::CharacterAt(bytes, index).length;
    if (length == 0) {
      line += kReplacement;
    } else {
      appendJsonCharacter(line, bytes.substr(index, length));
    }
    index += length == 0 ? 1 : length;
  }
  line += '"';
}

}  // namespace refhost
