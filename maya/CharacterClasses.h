// Classes of bytes. Bytes of 128 and above belong to none, whatever the locale.
#pragma once

#include <array>
#include <cstdint>

enum CharacterClass : std::uint8_t {
  kWhiteSpaceClass = 1,  // tab, line feed, carriage return, space
  kTerminatorClass = 2,  // white space and ";": what ends a word
  kNulClass = 4,
  kLetterClass = 8,
  kNumberStartClass = 16,  // digits, "-" and "."
  kQuoteClass = 32,
  kKeywordStartClass = 64,  // the first letters of the keywords that the main loop acts on
};

inline constexpr auto kCharacterClasses = [] {
  std::array<std::uint8_t, 256> classes{};
  const auto add = [&classes](char c, unsigned bits) {
    auto& entry = classes[static_cast<unsigned char>(c)];
    entry = static_cast<std::uint8_t>(entry | bits);
  };
  for (const char c : {' ', '\t', '\r', '\n'}) add(c, kWhiteSpaceClass | kTerminatorClass);
  add(';', kTerminatorClass);
  add('\0', kNulClass);
  add('"', kQuoteClass);
  for (const char c : {'c', 'C', 's', 'S'}) add(c, kKeywordStartClass);
  for (char c = 'a'; c <= 'z'; ++c) add(c, kLetterClass);
  for (char c = 'A'; c <= 'Z'; ++c) add(c, kLetterClass);
  for (char c = '0'; c <= '9'; ++c) add(c, kNumberStartClass);
  for (const char c : {'-', '.'}) add(c, kNumberStartClass);
  return classes;
}();

inline constexpr bool IsAny(char c, unsigned classes) {
  return (kCharacterClasses[static_cast<unsigned char>(c)] & classes) != 0;
}

inline constexpr bool IsWhiteSpace(char c) { return IsAny(c, kWhiteSpaceClass); }
inline constexpr bool IsWordTerminator(char c) { return IsAny(c, kTerminatorClass); }
inline constexpr bool IsLetter(char c) { return IsAny(c, kLetterClass); }
inline constexpr bool IsNumberStart(char c) { return IsAny(c, kNumberStartClass); }
