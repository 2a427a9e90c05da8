// The loop that every TextSkipper in blocks runs around its own classification of 64 bytes.
//
// A block becomes masks with a bit for each byte, the first byte in the lowest bit. With sixteen bytes, the
// lowest bit on the left, a "." for a 0, and "_" for a blank:
//
//   bytes                 2 . 5 _ - 1 ; _ s e t A t t r _
//   terminator            . . . 1 . . 1 1 . . . . . . . 1   white space and ";"
//   terminator << 1 | 1   1 . . . 1 . . 1 1 . . . . . . .   comes after one, or is the first byte
//   starts                1 . . . 1 . . . 1 . . . . . . .   of words: the above without terminators
//   harmless              1 1 1 . . 1 . . . 1 1 1 1 1 1 .   letters but c and s, digits, "."
//   dash                  . . . . 1 . . . . . . . . . . .
//   wordByte >> 1         1 1 . 1 1 . . 1 1 1 1 1 1 1 . .   a letter, digit, "-" or "." is next
//   stops                 . . . . . . . . 1 . . . . . . .   starts & ~(harmless | dash & wordByte >> 1)
//
// So "2.5" and "-1;" are passed over, and the reader goes on at "setAttr". Where the highest bit of
// `terminator` is set, as here, a word may start at the next block's first byte.
#pragma once

#include <bit>
#include <cstddef>
#include <cstdint>

#include "scan/ByteClasses.h"

namespace scan {

inline constexpr std::ptrdiff_t kSkipBlock = 64;

// One bit per byte of a block, the first byte in the lowest bit.
struct BlockMasks {
  std::uint64_t terminator;  // white space and ";"
  std::uint64_t semicolon;
  std::uint64_t lineFeed;
  std::uint64_t harmless;  // may begin a word that is passed over
  std::uint64_t dash;      // "-"
  std::uint64_t wordByte;  // letters, digits, "-" and ".": what makes a "-" before it begin a word
};

inline constexpr bool IsWordByte(char c) { return IsLetter(c) || IsNumberStart(c); }

enum class SkipWhere { BetweenCommands, InCommand };

template <SkipWhere kWhere, typename Classify>
[[gnu::always_inline]] inline const char* SkipBlocks(const char* position, const char* end,
                                                     std::int32_t* lines, Classify classify) {
  std::uint64_t boundary = 1;  // whether a token may start at the block's first byte
  const char* block = position;
  for (; end - block >= kSkipBlock; block += kSkipBlock) {
    const BlockMasks masks = classify(block);
    const std::uint64_t starts = ~masks.terminator & (masks.terminator << 1 | boundary);
    const std::uint64_t beforeWord = masks.wordByte >> 1 | std::uint64_t{IsWordByte(block[kSkipBlock])} << 63;
    std::uint64_t stops = starts & ~(masks.harmless | (masks.dash & beforeWord));
    if constexpr (kWhere == SkipWhere::InCommand) stops = (starts & ~masks.harmless) | masks.semicolon;
    if (stops != 0) {
      const int at = std::countr_zero(stops);
      *lines += std::popcount(masks.lineFeed & ((std::uint64_t{1} << at) - 1));
      return block + at;
    }
    *lines += std::popcount(masks.lineFeed);
    boundary = masks.terminator >> 63;
  }
  // A word that the last block cuts is left to be read whole.
  if (boundary == 0) {
    while (block != position && !IsWordEnd(block[-1])) --block;
  }
  return block;
}

}  // namespace scan
