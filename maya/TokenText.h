// The text of a token, as commands compare it: a view, which holds as long as the scene's text. Names that
// are kept are copied, by MAYA_Parse::BuildString and BuildQuote.
#pragma once

#include <cstddef>
#include <string_view>

#include "maya/SceneRecords.h"

namespace mayaimport {

// The longest token whose text is taken, in bytes. A longer one reads as empty.
inline constexpr std::size_t kLongestToken = 254;

inline constexpr std::size_t kQuoteCount = 2;  // of a string token

// How many bytes of a token are taken: all, or none of one that is too long. Quotes count.
inline std::size_t TakenLength(const char* first, const char* last) {
  const auto length = static_cast<std::size_t>(last - first + 1);
  return length <= kLongestToken ? length : 0;
}

// The text of a word: up to its first NUL.
inline std::string_view WordText(const char* first, const char* last) {
  const std::size_t length = TakenLength(first, last);
  std::size_t size = 0;
  while (size < length && first[size] != '\0') ++size;
  return {first, size};
}

// The text of a string token, without its quotes.
inline std::string_view QuotedText(const char* first, const char* last) {
  const std::size_t length = TakenLength(first, last);
  return length != 0 ? std::string_view(first + 1, length - kQuoteCount) : std::string_view();
}

}  // namespace mayaimport
