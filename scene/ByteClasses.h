// The classes of bytes for the reader of the whole scene.
#pragma once

#include <array>
#include <cstdint>

namespace scene {

enum ByteClass : std::uint8_t {
  kSpaceByte = 1,   // white space
  kWordByte = 2,    // may stand in a word: a command, an option, a number, a path without quotes
  kLetterByte = 4,  // letters and "_": what a command begins with
  kDigitByte = 8,
  kPunctuationByte = 16,  // "(", ")", "}", ",": each a token of its own, as is "{"
  // The search for the end of a command examines these: ";", a quote, "/", a line feed.
  kPauseByte = 32,
  // None of the above, and not "{". Outside strings and comments it has no meaning.
  kStrangeByte = 64,
  kBraceByte = 128,  // "{": two of them open a template field
};

inline constexpr auto kByteClasses = [] {
  std::array<std::uint8_t, 256> classes{};
  const auto add = [&classes](char c, unsigned bits) {
    auto& entry = classes[static_cast<unsigned char>(c)];
    entry = static_cast<std::uint8_t>(entry | bits);
  };
  for (const char c : {' ', '\t', '\r', '\n', '\v', '\f'}) add(c, kSpaceByte);
  for (char c = 'a'; c <= 'z'; ++c) add(c, kWordByte | kLetterByte);
  for (char c = 'A'; c <= 'Z'; ++c) add(c, kWordByte | kLetterByte);
  add('_', kWordByte | kLetterByte);
  for (char c = '0'; c <= '9'; ++c) add(c, kWordByte | kDigitByte);
  for (const char c : {'-', '+', '.', ':', '|', '[', ']', '#', '*', '/'}) add(c, kWordByte);
  for (const char c : {'(', ')', '}', ','}) add(c, kPunctuationByte);
  for (const char c : {';', '"', '/', '\n'}) add(c, kPauseByte);
  add('{', kBraceByte);
  for (auto& entry : classes) {
    if (entry == 0) entry = kStrangeByte;
  }
  return classes;
}();

inline constexpr bool IsByte(char c, unsigned classes) {
  return (kByteClasses[static_cast<unsigned char>(c)] & classes) != 0;
}

}  // namespace scene
