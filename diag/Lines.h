// Lines and columns of a text, found from byte offsets.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string_view>
#include <vector>

namespace diag {

// Both count from 1. A column counts bytes. A line ends as editors see it, and as the import counts: after a
// line feed, or after a carriage return that no line feed follows.
struct LineAndColumn {
  std::uint32_t line = 1;
  std::uint32_t column = 1;

  bool operator==(const LineAndColumn&) const = default;
};

// Refers to the text, which must outlive it. All calls of At together pass over the text once at most; each
// call reads a few thousand bytes more.
class Lines {
 public:
  explicit Lines(std::string_view text) : text_(text) {}

  // Of the byte at the offset. An offset beyond the text counts as its end.
  LineAndColumn At(std::uint64_t offset);

 private:
  struct Block {
    std::uint32_t lineEnds;   // before the block
    std::uint64_t lineStart;  // of the line that its first byte stands in
  };

  void CountTo(std::size_t at);

  std::string_view text_;
  std::vector<Block> blocks_;  // as far as counted
};

}  // namespace diag
