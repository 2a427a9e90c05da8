#include "refhost/ShownText.h"

#include <cstddef>
#include <cstdint>

#include "hostutil/HostSetup.h"

namespace refhost {
namespace {

constexpr std::string_view kReplacement = "\xEF\xBF\xBD";  // U+FFFD
constexpr unsigned kFirstContinuation = 0x80;
constexpr unsigned kLastContinuation = 0xBF;

unsigned byteAt(std::string_view bytes, std::size_t index) {
  return static_cast<unsigned char>(bytes[index]);
}

// How long a sequence that begins with this byte is, and what its second byte may be. Length 0: none begins
// so.
struct Sequence {
  std::size_t length;
  unsigned secondFrom;
  unsigned secondTo;
};

Sequence sequenceOf(unsigned first) {
  if (first < 0x80) return {1, 0, 0};
  if (first >= 0xC2 && first <= 0xDF) return {2, kFirstContinuation, kLastContinuation};
  if (first == 0xE0) return {3, 0xA0, kLastContinuation};   // shorter forms exist below
  if (first == 0xED) return {3, kFirstContinuation, 0x9F};  // surrogates above
  if (first >= 0xE1 && first <= 0xEF) return {3, kFirstContinuation, kLastContinuation};
  if (first == 0xF0) return {4, 0x90, kLastContinuation};   // shorter forms exist below
  if (first == 0xF4) return {4, kFirstContinuation, 0x8F};  // beyond U+10FFFF above
  if (first >= 0xF1 && first <= 0xF3) return {4, kFirstContinuation, kLastContinuation};
  return {0, 0, 0};
}

// The length of the valid sequence at the index, 0 when there is none.
std::size_t validLength(std::string_view bytes, std::size_t index) {
  const Sequence sequence = sequenceOf(byteAt(bytes, index));
  if (sequence.length > bytes.size() - index) return 0;
  for (std::size_t offset = 1; offset < sequence.length; ++offset) {
    const unsigned byte = byteAt(bytes, index + offset);
    const unsigned from = offset == 1 ? sequence.secondFrom : kFirstContinuation;
    const unsigned to = offset == 1 ? sequence.secondTo : kLastContinuation;
    if (byte < from || byte > to) return 0;
  }
  return sequence.length;
}

void appendEscape(std::string& line, unsigned character) {
  constexpr char digits[] = "0123456789abcdef";
  line += "\\u00";
  line += digits[character >> 4];
  line += digits[character & 0xF];
}

void appendJsonCharacter(std::string& line, std::string_view character) {
  constexpr unsigned firstPrintable = 0x20;
  constexpr unsigned del = 0x7F;
  const unsigned first = byteAt(character, 0);
  if (first < firstPrintable || first == del) {
    appendEscape(line, first);
  } else if (first == 0xC2 && byteAt(character, 1) < 0xA0) {
    appendEscape(line, byteAt(character, 1));  // U+0080 to U+009F
  } else {
    if (first == '"' || first == '\\') line += '\\';
    line += character;
  }
}

}  // namespace

std::string shownText(std::string_view bytes) {
  std::string text;
  for (std::size_t index = 0; index < bytes.size();) {
    const std::size_t length = validLength(bytes, index);
    text += length == 0 ? kReplacement : bytes.substr(index, length);
    index += length == 0 ? 1 : length;
  }
  return text;
}

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
    const std::size_t length = validLength(bytes, index);
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
