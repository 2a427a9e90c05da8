// Counts line feeds.
#pragma once

#include <cstddef>
#include <cstdint>
#include <cstring>

namespace scan {

// The line feeds from `begin` up to `end`.
inline std::int32_t CountLineFeeds(const char* begin, const char* end) {
  std::int32_t count = 0;
  for (const char* at = begin; at != end; ++at, ++count) {
    at = static_cast<const char*>(std::memchr(at, '\n', static_cast<std::size_t>(end - at)));
    if (at == nullptr) break;
  }
  return count;
}

}  // namespace scan
