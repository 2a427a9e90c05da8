#include "diag/Lines.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <numeric>

namespace diag {
namespace {

constexpr std::size_t kBlock = 4096;

bool IsLineEnd(char c, char next) { return c == '\n' || (c == '\r' && next != '\n'); }

// The number of line ends in a part of the text. A carriage return at the end of the part is judged by the
// byte after the part; at the end of the text it ends a line. Counts in an array of bytes, which compilers
// turn into vector instructions, unlike one wide counter. A block is so short that no byte overflows.
std::uint32_t CountLineEnds(std::string_view text, std::size_t begin, std::size_t end) {
  constexpr std::size_t kLanes = 64;
  static_assert(kBlock / kLanes < 256);
  std::array<std::uint8_t, kLanes> lanes{};
  std::size_t at = begin;
  for (; at + kLanes <= end && at + kLanes < text.size(); at += kLanes) {
    const char* const bytes = text.data() + at;
    for (std::size_t lane = 0; lane < kLanes; ++lane) {
      const int feed = bytes[lane] == '\n';
      const int lone = static_cast<int>(bytes[lane] == '\r') & static_cast<int>(bytes[lane + 1] != '\n');
      lanes[lane] = static_cast<std::uint8_t>(lanes[lane] + feed + lone);
    }
  }
  std::uint32_t rest = 0;
  for (; at < end; ++at) rest += IsLineEnd(text[at], at + 1 < text.size() ? text[at + 1] : '\0') ? 1 : 0;
  return std::accumulate(lanes.begin(), lanes.end(), rest);
}

// The start of the line that the end of the part stands in; `none` where the part has no line end.
std::uint64_t LastLineStart(std::string_view text, std::size_t begin, std::size_t end, std::uint64_t none) {
  for (std::size_t after = end; after > begin; --after) {
    if (IsLineEnd(text[after - 1], after < text.size() ? text[after] : '\0')) return after;
  }
  return none;
}

}  // namespace

// Counts up to the block that holds `at`, from where the last call stopped.
void Lines::CountTo(std::size_t at) {
  if (blocks_.empty()) blocks_.push_back({0, 0});
  while (blocks_.size() <= at / kBlock) {
    Block block = blocks_.back();
    const std::size_t start = (blocks_.size() - 1) * kBlock;
    const std::size_t end = std::min(start + kBlock, text_.size());
    const std::uint32_t lineEnds = CountLineEnds(text_, start, end);
    block.lineEnds += lineEnds;
    if (lineEnds != 0) block.lineStart = LastLineStart(text_, start, end, block.lineStart);
    blocks_.push_back(block);
  }
}

LineAndColumn Lines::At(std::uint64_t offset) {
  const std::size_t at = std::min<std::uint64_t>(offset, text_.size());
  CountTo(at);
  const Block& block = blocks_[at / kBlock];
  const std::size_t blockStart = at / kBlock * kBlock;
  const std::uint64_t start = LastLineStart(text_, blockStart, at, block.lineStart);
  return {block.lineEnds + CountLineEnds(text_, blockStart, at) + 1,
          static_cast<std::uint32_t>(at - start + 1)};
}

}  // namespace diag
