#include "diag/Lines.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <numeric>

namespace diag {
namespace {

constexpr std::size_t kBlock = 4096;

// Counts in bytes, side by side: a compiler makes vector instructions of it, which it does not of one wide
// counter. A block is short enough for the bytes to hold.
std::uint32_t CountLineFeeds(std::string_view text) {
  constexpr std::size_t kLanes = 64;
  static_assert(kBlock / kLanes < 256);
  std::array<std::uint8_t, kLanes> lanes{};
  std::size_t at = 0;
  for (; at + kLanes <= text.size(); at += kLanes) {
    for (std::size_t lane = 0; lane < kLanes; ++lane) lanes[lane] += text[at + lane] == '\n';
  }
  const auto rest = std::count(text.begin() + static_cast<std::ptrdiff_t>(at), text.end(), '\n');
  return std::accumulate(lanes.begin(), lanes.end(), static_cast<std::uint32_t>(rest));
}

// Where the line starts that goes on after the text, counted from the text's first byte.
std::uint64_t LastLineStart(std::string_view text, std::uint64_t before, std::uint64_t none) {
  const std::size_t feed = text.rfind('\n');
  return feed == std::string_view::npos ? none : before + feed + 1;
}

}  // namespace

// Counts what lies before `at` and has not been counted.
void Lines::CountTo(std::size_t at) {
  if (blocks_.empty()) blocks_.push_back({0, 0});
  while (blocks_.size() <= at / kBlock) {
    Block block = blocks_.back();
    const std::size_t start = (blocks_.size() - 1) * kBlock;
    const std::string_view text = text_.substr(start, kBlock);
    block.lineFeeds += CountLineFeeds(text);
    block.lineStart = LastLineStart(text, start, block.lineStart);
    blocks_.push_back(block);
  }
}

LineAndColumn Lines::At(std::uint64_t offset) {
  const std::size_t at = std::min<std::uint64_t>(offset, text_.size());
  CountTo(at);
  const Block& block = blocks_[at / kBlock];
  const std::size_t blockStart = at / kBlock * kBlock;
  const std::string_view before = text_.substr(blockStart, at - blockStart);
  const std::uint64_t start = LastLineStart(before, blockStart, block.lineStart);
  return {block.lineFeeds + CountLineFeeds(before) + 1, static_cast<std::uint32_t>(at - start + 1)};
}

}  // namespace diag
