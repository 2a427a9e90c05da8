#include "text/JsonText.h"

#include "text/Utf8.h"

namespace text {
namespace {

constexpr char32_t kReplacement = 0xfffd;

void AppendUnit(std::string* out, unsigned unit) {
  constexpr char kDigits[] = "0123456789abcdef";
  *out += "\\u";
  for (const unsigned shift : {12u, 8u, 4u, 0u}) *out += kDigits[(unit >> shift) & 0xfu];
}

void AppendAscii(std::string* out, char32_t point) {
  constexpr char32_t kFirstOfPairs = 0x10000;
  constexpr std::string_view kShort = "\b\t\n\f\r\"\\";
  constexpr std::string_view kLetters = "btnfr\"\\";
  const std::size_t place = point < 0x80 ? kShort.find(static_cast<char>(point)) : std::string_view::npos;
  if (place != std::string_view::npos) {
    *out += '\\';
    *out += kLetters[place];
  } else if (point >= 0x20 && point < 0x7f) {
    *out += static_cast<char>(point);
  } else if (point < kFirstOfPairs) {
    AppendUnit(out, point);
  } else {
    AppendUnit(out, 0xd800u + ((point - kFirstOfPairs) >> 10));
    AppendUnit(out, 0xdc00u + ((point - kFirstOfPairs) & 0x3ffu));
  }
}

// `bytes` are those of the character.
void AppendUtf8(std::string* out, char32_t point, std::string_view bytes) {
  if (point < 0x20 || (point >= 0x7f && point < 0xa0)) return AppendUnit(out, point);
  if (point == '"' || point == '\\') *out += '\\';
  *out += bytes;
}

}  // namespace

void AppendJsonText(std::string* out, std::string_view bytes, JsonForm form) {
  constexpr std::string_view kReplacementBytes = "\xEF\xBF\xBD";
  *out += '"';
  for (std::size_t at = 0; at < bytes.size();) {
    const Character character = CharacterAt(bytes, at);
    const bool valid = character.length != 0;
    const std::size_t length = valid ? character.length : 1;
    const char32_t point = valid ? character.point : kReplacement;
    if (form == JsonForm::Ascii) {
      AppendAscii(out, point);
    } else {
      AppendUtf8(out, point, valid ? bytes.substr(at, length) : kReplacementBytes);
    }
    at += length;
  }
  *out += '"';
}

}  // namespace text
