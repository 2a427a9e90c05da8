#include "diag/Columns.h"

#include <algorithm>
#include <iterator>

#include "text/Utf8.h"

namespace diag {
namespace {

struct Block {
  char32_t first, last;
};

// Blocks of characters that take two columns, nearly: what terminals make of single ones differs.
constexpr Block kWide[] = {{0x1100, 0x115f},   {0x2e80, 0x303e},   {0x3041, 0xa4cf},  {0xac00, 0xd7a3},
                           {0xf900, 0xfaff},   {0xfe30, 0xfe6f},   {0xff00, 0xff60},  {0xffe0, 0xffe6},
                           {0x1f300, 0x1f64f}, {0x1f900, 0x1f9ff}, {0x20000, 0x3fffd}};

// Marks that stand over the character before them.
constexpr Block kOverOthers[] = {{0x300, 0x36f},   {0x483, 0x489},   {0x591, 0x5bd},
                                 {0x1ab0, 0x1aff}, {0x1dc0, 0x1dff}, {0x20d0, 0x20ff},
                                 {0x3099, 0x309a}, {0xfe00, 0xfe0f}, {0xfe20, 0xfe2f}};

template <std::size_t count>
bool IsIn(const Block (&blocks)[count], char32_t point) {
  return std::any_of(std::begin(blocks), std::end(blocks),
                     [point](const Block& block) { return block.first <= point && point <= block.last; });
}

}  // namespace

std::size_t ColumnsOf(std::string_view shown) {
  std::size_t columns = 0;
  for (std::size_t at = 0; at < shown.size();) {
    const text::Character character = text::CharacterAt(shown, at);
    at += std::max<std::size_t>(1, character.length);
    if (IsIn(kOverOthers, character.point)) continue;
    columns += IsIn(kWide, character.point) ? 2 : 1;
  }
  return columns;
}

}  // namespace diag
