// The loop of every TextSkipper that works in blocks, around its own classification of 64 bytes.
//
// A block becomes masks with a bit for each byte, the first byte in the lowest bit. With sixteen bytes, the
// lowest bit on the left, a "." for a 0, and "_" for a blank:
//
//   bytes                 2 . 5 _ - 1 ; _ s e t A t t r _
//   terminator            . . . 1 . . 1 1 . . . . . . . 1   white space and ";"
//   terminator << 1 | 1   1 . . . 1 . . 1 1 . . . . . . .   comes after one, or is the first byte of all
//   starts                1 . . . 1 . . . 1 . . . . . . .   of words: the above without terminators
//   harmless              1 1 1 . . 1 . . . 1 1 1 1 1 1 .   letters but c and s, digits, "."
//   dash                  . . . . 1 . . . . . . . . . . .
//   wordByte >> 1         1 1 . 1 1 . . 1 1 1 1 1 1 1 . .   a letter, digit, "-" or "." is next
//   stops                 . . . . . . . . 1 . . . . . . .   starts & ~(harmless | dash & wordByte >> 1)
//
// So "2.5" and "-1;" are passed over, and the reader goes on at "setAttr". Masks are made only of the first
// block and of those where something may stop.
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

// `Processor` has two functions of its own:
//
//   BlockMasks Classify(block)                   of the 64 bytes of a block
//   const char* SkipWithoutStops<kWhere>(block, end, lines)
//
// SkipWithoutStops skips the blocks in which nothing can stop, which are most of them, and decides that in
// vector registers. It returns the first block in which something may stop, or which is not whole. A "-" is
// judged together with the byte after it, so the last byte of a block is left to the caller. The byte before
// each byte of a block comes from a second load, one byte earlier, which is still part of the text. Line
// feeds are counted by subtracting a comparison, 0 or -1 in each byte, from a vector of counters, which is
// emptied before one of them is full.
template <SkipWhere kWhere, typename Processor>
[[gnu::always_inline]] inline const char* SkipBlocks(const char* position, const char* end,
                                                     std::int32_t* lines) {
  const char* block = position;
  const auto startsWord = [&] { return block == position || IsWordEnd(block[-1]); };
  while (end - block >= kSkipBlock) {
    const BlockMasks masks = Processor::Classify(block);
    const std::uint64_t starts = ~masks.terminator & (masks.terminator << 1 | std::uint64_t{startsWord()});
    const std::uint64_t beforeWord = masks.wordByte >> 1 | std::uint64_t{IsWordByte(block[kSkipBlock])} << 63;
    std::uint64_t stops = starts & ~(masks.harmless | (masks.dash & beforeWord));
    if constexpr (kWhere == SkipWhere::InCommand) stops = (starts & ~masks.harmless) | masks.semicolon;
    if (stops != 0) {
      const int at = std::countr_zero(stops);
      *lines += std::popcount(masks.lineFeed & ((std::uint64_t{1} << at) - 1));
      return block + at;
    }
    *lines += std::popcount(masks.lineFeed);
    block = Processor::template SkipWithoutStops<kWhere>(block + kSkipBlock, end, lines);
    if (block[-1] == '-') --block;  // whether it stops depends on what comes after it
  }
  // A word that the last block cuts is left to the reader.
  if (!startsWord()) {
    while (block != position && !IsWordEnd(block[-1])) --block;
  }
  return block;
}

}  // namespace scan
