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
  std::size_t size = 0;
  while (size < length && first[size] != '\0') ++size;
  return {first, size};
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
