#include "diag/Lines.h"

#include <algorithm>
#include <cstddef>

namespace diag {
namespace {

constexpr std::size_t kBlock = 4096;

std::uint32_t CountLineFeeds(std::string_view text) {
  return static_cast<std::uint32_t>(std::count(text.begin(), text.end(), '\n'));
}

// Where the line starts that goes on after the text, counted from the text's first byte.
std::uint64_t LastLineStart(std::string_view text, std::uint64_t before, std::uint64_t none) {
  const std::size_t feed = text.rfind('\n');
  return feed == std::string_view::npos ? none : before + feed + 1;
}

}  // namespace

void Lines::Prepare() {
  blocks_.reserve(text_.size() / kBlock + 1);
  Block block{0, 0};
  for (std::size_t at = 0; at <= text_.size(); at += kBlock) {
    blocks_.push_back(block);
    const std::string_view text = text_.substr(at, kBlock);
    block.lineFeeds += CountLineFeeds(text);
    block.lineStart = LastLineStart(text, at, block.lineStart);
  }
}

LineAndColumn Lines::At(std::uint64_t offset) {
  if (blocks_.empty()) Prepare();
  const std::size_t at = std::min<std::uint64_t>(offset, text_.size());
  const Block& block = blocks_[at / kBlock];
  const std::size_t blockStart = at / kBlock * kBlock;
  const std::string_view before = text_.substr(blockStart, at - blockStart);
  const std::uint64_t start = LastLineStart(before, blockStart, block.lineStart);
  return {block.lineFeeds + CountLineFeeds(before) + 1, static_cast<std::uint32_t>(at - start + 1)};
}

}  // namespace diag
