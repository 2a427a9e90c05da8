// Classes of the bytes of a scene's text: one table for whatever looks at single bytes. Bytes of 128 and
// above belong to none, whatever the locale.
#pragma once

#include <array>
#include <cstdint>

namespace scan {

enum ByteClass : std::uint8_t {
  kWhiteSpace = 1,  // tab, line feed, carriage return, space
  kWordEnd = 2,     // white space and ";"
  kNul = 4,
  kLetter = 8,
  kDigit = 16,
  kNumberStart = 32,  // digits, "-" and "."
  kQuote = 64,
  kKeywordStart = 128,  // c and s in either case: the keywords that act between commands begin so
};

inline constexpr auto kByteClasses = [] {
  std::array<std::uint8_t, 256> classes{};
  const auto add = [&classes](char c, unsigned bits) {
    auto& entry = classes[static_cast<unsigned char>(c)];
    entry = static_cast<std::uint8_t>(entry | bits);
  };
  for (const char c : {' ', '\t', '\r', '\n'}) add(c, kWhiteSpace | kWordEnd);
  add(';', kWordEnd);
  add('\0', kNul);
  add('"', kQuote);
  for (const char c : {'c', 'C', 's', 'S'}) add(c, kKeywordStart);
  for (char c = 'a'; c <= 'z'; ++c) add(c, kLetter);
  for (char c = 'A'; c <= 'Z'; ++c) add(c, kLetter);
  for (char c = '0'; c <= '9'; ++c) add(c, kDigit | kNumberStart);
  for (const char c : {'-', '.'}) add(c, kNumberStart);
  return classes;
}();

// Whether the byte belongs to one of the classes, which are or-ed together.
inline constexpr bool IsAny(char c, unsigned classes) {
  return (kByteClasses[static_cast<unsigned char>(c)] & classes) != 0;
}

inline constexpr bool IsWhiteSpace(char c) { return IsAny(c, kWhiteSpace); }
inline constexpr bool IsWordEnd(char c) { return IsAny(c, kWordEnd); }
inline constexpr bool IsLetter(char c) { return IsAny(c, kLetter); }
inline constexpr bool IsDigit(char c) { return IsAny(c, kDigit); }
inline constexpr bool IsNumberStart(char c) { return IsAny(c, kNumberStart); }

}  // namespace scan
