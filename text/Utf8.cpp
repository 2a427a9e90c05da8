#include "text/Utf8.h"

#include <cstdint>

namespace text {
namespace {

std::uint8_t ByteAt(std::string_view bytes, std::size_t at) { return static_cast<std::uint8_t>(bytes[at]); }

}  // namespace

Character CharacterAt(std::string_view bytes, std::size_t at) {
  constexpr Character kInvalid{0, 0};
  constexpr char32_t kSmallest[] = {0, 0, 0x80, 0x800, 0x10000};
  const std::uint8_t first = ByteAt(bytes, at);
  if (first < 0x80) return {1, first};
  const std::size_t length = first < 0xc2 ? 0 : first < 0xe0 ? 2 : first < 0xf0 ? 3 : first < 0xf5 ? 4 : 0;
  if (length == 0 || length > bytes.size() - at) return kInvalid;
  char32_t point = first & (0x7fu >> length);
  for (std::size_t i = 1; i < length; ++i) {
    const std::uint8_t byte = ByteAt(bytes, at + i);
    if (!IsContinuation(static_cast<char>(byte))) return kInvalid;
    point = (point << 6) | (byte & 0x3fu);
  }
  const bool surrogate = point >= 0xd800 && point < 0xe000;
  if (point < kSmallest[length] || point > 0x10ffff || surrogate) return kInvalid;
  return {length, point};
}

bool IsUtf8(std::string_view bytes) {
  for (std::size_t at = 0; at < bytes.size();) {
    const std::size_t length = CharacterAt(bytes, at).length;
    if (length == 0) return false;
    at += length;
  }
  return true;
}

std::string ValidUtf8(std::string_view bytes) {
  constexpr std::string_view kReplacement = "\xEF\xBF\xBD";
  std::string valid;
  valid.reserve(bytes.size());
  for (std::size_t at = 0; at < bytes.size();) {
    const std::size_t length = CharacterAt(bytes, at).length;
    valid += length == 0 ? kReplacement : bytes.substr(at, length);
    at += length == 0 ? 1 : length;
  }
  return valid;
}

}  // namespace text
