// Looks for the bytes that end a word or a string, eight at a time.
//
// Words and strings are short, as a rule a few bytes to a few dozen. A test of eight bytes costs about as
// much as two tests of one, and unlike a loop over bytes it does not end in a mispredicted branch each time.
#pragma once

#include <bit>
#include <cstddef>
#include <cstdint>
#include <cstring>

#include "scan/ByteClasses.h"

namespace scan {
namespace eight_bytes {

inline constexpr std::ptrdiff_t kWordSize = sizeof(std::uint64_t);
inline constexpr std::uint64_t kEach = 0x0101010101010101u;
inline constexpr std::uint64_t kHighBits = kEach * 0x80;

// Marks the bytes below `limit`, at most 0x80, by their highest bit. Only the lowest mark is reliable: those
// above it may come from a borrow.
inline constexpr std::uint64_t MarkBelow(std::uint64_t bytes, unsigned char limit) {
  return (bytes - kEach * limit) & ~bytes & kHighBits;
}

inline constexpr std::uint64_t MarkEqual(std::uint64_t bytes, char c) {
  return MarkBelow(bytes ^ (kEach * static_cast<unsigned char>(c)), 1);
}

// The first byte of one of the classes. `mark` marks all of them among eight bytes, and perhaps others.
// Somewhere from `at` to `end`, which is readable, there is one; nothing after `end` is read.
template <typename Mark>
[[gnu::always_inline]] inline const char* FindAny(const char* at, const char* end, unsigned classes,
                                                  Mark mark) {
  if constexpr (std::endian::native == std::endian::little) {
    while (end - at >= kWordSize) {
      std::uint64_t bytes = 0;
      std::memcpy(&bytes, at, sizeof bytes);
      const std::uint64_t marks = mark(bytes);
      if (marks == 0) {
        at += kWordSize;
        continue;
      }
      at += std::countr_zero(marks) / 8;
      if (IsAny(*at, classes)) return at;
      ++at;
    }
  }
  while (!IsAny(*at, classes)) ++at;
  return at;
}

}  // namespace eight_bytes

// The first white space, ";" or NUL. `end` is the text's terminating NUL, and not before `at`.
inline const char* FindWordEnd(const char* at, const char* end) {
  constexpr unsigned char kAfterSpace = ' ' + 1;
  return eight_bytes::FindAny(at, end, kWordEnd | kNul, [](std::uint64_t bytes) {
    return eight_bytes::MarkBelow(bytes, kAfterSpace) | eight_bytes::MarkEqual(bytes, ';');
  });
}

// The first quote or NUL, likewise.
inline const char* FindQuote(const char* at, const char* end) {
  return eight_bytes::FindAny(at, end, kQuote | kNul, [](std::uint64_t bytes) {
    return eight_bytes::MarkEqual(bytes, '"') | eight_bytes::MarkEqual(bytes, '\0');
  });
}

}  // namespace scan
