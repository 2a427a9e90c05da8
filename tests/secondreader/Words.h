// Comparing and cutting words.
#pragma once

#include <algorithm>
#include <string>
#include <string_view>

namespace secondreader {

inline char lower(char letter) {
  return letter >= 'A' && letter <= 'Z' ? static_cast<char>(letter - 'A' + 'a') : letter;
}

// Without regard to case.
inline bool same(std::string_view a, std::string_view b) {
  return a.size() == b.size() &&
         std::equal(a.begin(), a.end(), b.begin(), [](char x, char y) { return lower(x) == lower(y); });
}

// What of a token is kept: nothing of one of 255 bytes or more, and nothing after a NUL.
inline std::string copied(std::string_view token) {
  constexpr std::size_t kTooLong = 255;
  if (token.size() >= kTooLong) return {};
  return std::string(token.substr(0, token.find('\0')));
}

// The same of a string token, without its quotes.
inline std::string unquoted(std::string_view token) {
  const std::string text = copied(token);
  return text.size() < 2 ? std::string() : text.substr(1, text.size() - 2);
}

}  // namespace secondreader
