// Characters in UTF-8 bytes and in UTF-16 units, with undecodable bytes kept.
//
// A byte that is no part of valid UTF-8 travels as the lone surrogate U+DC00 + byte (U+DC80 to U+DCFF).
// Nothing here allocates, but for the conversions to std::string.
#pragma once

#include <string>

#include "hostapi/HostTypes.h"

namespace hostutil {

constexpr char32_t kReplacementCharacter = 0xFFFD;
constexpr int kMostUnits = 2;  // of one character
constexpr int kMostBytes = 4;  // of one character

struct DecodedCharacter {
  char32_t codePoint;  // a lone surrogate where the text holds one, or a byte that cannot be decoded
  int length;          // bytes or units that it takes, 1 or more
};

// The character at the start of a text that is NUL-terminated and not empty.
DecodedCharacter DecodeBytes(const char* bytes);
DecodedCharacter DecodeUnits(const HostUTF16Unit* units);

// Writes a character and returns its length in units or bytes. A lone surrogate takes one unit, or the three
// bytes that UTF-8 would have for it.
int EncodeUnits(char32_t codePoint, HostUTF16Unit* units);
int EncodeBytes(char32_t codePoint, char* bytes);

// The character as a user sees it: U+FFFD for a lone surrogate.
char32_t Shown(char32_t codePoint);

// The bytes by which the system knows a path.
std::string PathBytes(const HostUTF16Unit* units);

// The text as a user sees it, on one line: control characters and line separators become \uXXXX.
std::string ShownLine(const HostUTF16Unit* units);

}  // namespace hostutil
