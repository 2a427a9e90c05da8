// The text of a token, as commands take it.
#pragma once

#include <cstddef>
#include <cstring>
#include <string_view>

#include "maya/SceneRecords.h"

// The longest token whose text is taken, in bytes. A longer one reads as empty.
inline constexpr std::size_t kLongestToken = 254;

// The text of a word: up to its first NUL.
inline std::string_view WordText(const char* first, const char* last) {
  const auto length = static_cast<std::size_t>(last - first) + 1;
  if (length > kLongestToken) return "";
  const auto* nul = static_cast<const char*>(std::memchr(first, '\0', length));
  return {first, nul != nullptr ? static_cast<std::size_t>(nul - first) : length};
}

// The text of a string token, without its quotes. The quotes count for its length.
inline std::string_view QuotedText(const char* first, const char* last) {
  const auto length = static_cast<std::size_t>(last - first) + 1;
  if (length > kLongestToken) return "";
  return {first + 1, length - 2};
}

// Fills a name field, which holds zeros behind its text before and afterwards.
inline void StoreName(char (&name)[kNameCapacity], std::string_view text) {
  if (name[0] != '\0') std::memset(name, 0, sizeof name);
  std::memcpy(name, text.data(), text.size());
}
