// UTF-8: its characters, and the replacement of bytes that are not valid.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace text {

// A code point and its length in bytes; a length of 0 where the bytes are not valid UTF-8.
struct Character {
  std::size_t length = 0;
  char32_t point = 0;
};

// The character that begins at the index, which is below the size. Overlong forms, surrogates and code points
// beyond U+10FFFF are not valid.
Character CharacterAt(std::string_view bytes, std::size_t at);

bool IsUtf8(std::string_view bytes);

// Whether the byte stands inside a character, after its first byte.
inline bool IsContinuation(char byte) { return (static_cast<unsigned char>(byte) & 0xc0) == 0x80; }

// The bytes, with U+FFFD for each byte that is not part of valid UTF-8.
std::string ValidUtf8(std::string_view bytes);

}  // namespace text
