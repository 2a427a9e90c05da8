#include "diag/Excerpt.h"

#include <algorithm>
#include <cstddef>

#include "diag/Columns.h"
#include "diag/ShownText.h"
#include "text/Utf8.h"

namespace diag {
namespace {

// The bytes of a long line that are shown: before the mark, and in all.
constexpr std::size_t kBefore = 40;
constexpr std::size_t kMost = 100;

constexpr std::string_view kCut = "...";

// Tabs are shown as single blanks, so that the mark stands under its text everywhere.
std::string Shown(std::string_view bytes) {
  std::string blanks(bytes);
  std::replace(blanks.begin(), blanks.end(), '\t', ' ');
  return ShownText(blanks);
}

// Moves a place to the beginning of the character that it is in, within a few bytes.
std::size_t AtCharacter(std::string_view line, std::size_t at) {
  for (int steps = 0; steps < 3 && at > 0 && at < line.size() && text::IsContinuation(line[at]); ++steps)
    --at;
  return at;
}

}  // namespace

std::string Excerpt(std::string_view text, const Range& range) {
  if (range.offset > text.size()) return {};
  const auto offset = static_cast<std::size_t>(range.offset);
  // The line is searched only as far as it can be shown.
  const std::size_t earliest = offset > kMost ? offset - kMost : 0;
  // The line feed of a line end of two bytes belongs to the line that it ends.
  const bool insideLineEnd = offset > 0 && text[offset - 1] == '\r' && text.substr(offset, 1) == "\n";
  const std::size_t before = offset - earliest - (insideLineEnd ? 1 : 0);
  const std::size_t lineEndBefore = text.substr(earliest, before).find_last_of("\r\n");
  std::size_t start = lineEndBefore == std::string_view::npos ? earliest : earliest + lineEndBefore + 1;
  const bool wholeStart = start == 0 || text[start - 1] == '\n' || text[start - 1] == '\r';
  const std::string_view rest = text.substr(start, offset - start + kMost);
  const std::string_view line =
      rest.substr(0, std::min(rest.find_first_of("\r\n", offset - start), rest.size()));
  const std::size_t lineEnd = start + line.size();
  const bool wholeEnd = lineEnd == text.size() || text[lineEnd] == '\n' || text[lineEnd] == '\r';
  if (line.empty()) return {};

  const std::size_t mark = offset - start;
  std::size_t first = 0;
  if (!wholeStart || (line.size() > kMost && mark > kBefore)) first = mark > kBefore ? mark - kBefore : 0;
  first = AtCharacter(line, first);
  const std::size_t last = AtCharacter(line, std::min(line.size(), first + kMost));
  const bool cutBefore = !wholeStart || first != 0;
  const bool cutAfter = !wholeEnd || last != line.size();
  const std::size_t markEnd = std::min<std::size_t>(
      last, mark + static_cast<std::size_t>(std::min<std::uint64_t>(range.length, kMost)));

  std::string shown = cutBefore ? std::string(kCut) : std::string();
  shown += Shown(line.substr(first, mark - first));
  const std::size_t column = ColumnsOf(shown);
  const std::string marked = Shown(line.substr(mark, markEnd - mark));
  shown += marked + Shown(line.substr(markEnd, last - markEnd));
  if (cutAfter) shown += kCut;
  const std::size_t width = std::max<std::size_t>(1, ColumnsOf(marked));
  return shown + '\n' + std::string(column, ' ') + '^' + std::string(width - 1, '~') + '\n';
}

}  // namespace diag
