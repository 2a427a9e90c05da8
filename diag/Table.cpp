// The table as a whole: its parts in order, and how a row is found.
#include <fmt/format.h>

#include <algorithm>
#include <cstddef>
#include <initializer_list>
#include <vector>

#include "diag/TableInternal.h"

namespace diag {
namespace {

std::vector<Entry> WholeTable() {
  std::vector<Entry> table;
  for (const std::span<const Entry> part :
       {ReadingCodes(), NodeCodes(), CurveCodes(), DriverCodes(), CameraCodes(), BakeCodes(), StopCodes(),
        LossCodes(), PictureCodes(), ProcessCodes(), ExportCodes()}) {
    table.insert(table.end(), part.begin(), part.end());
  }
  return table;
}

// One more than the number of the largest placeholder of a text; 0 where there is none.
std::size_t LargestPlaceholder(std::string_view text) {
  std::size_t largest = 0;
  for (std::size_t at = text.find('{'); at != std::string_view::npos; at = text.find('{', at + 1)) {
    if (at + 2 < text.size() && text[at + 1] >= '0' && text[at + 1] <= '9' && text[at + 2] == '}') {
      largest = std::max(largest, static_cast<std::size_t>(text[at + 1] - '0') + 1);
    }
  }
  return largest;
}

}  // namespace

std::span<const Entry> Table() {
  static const std::vector<Entry> kTable = WholeTable();
  return kTable;
}

const Entry& EntryOf(Code code) {
  const std::span<const Entry> table = Table();
  return *std::lower_bound(table.begin(), table.end(), code,
                           [](const Entry& entry, Code wanted) { return entry.code < wanted; });
}

std::size_t ArgumentCount(const Entry& entry) {
  return std::max(LargestPlaceholder(entry.sentence), LargestPlaceholder(entry.help));
}

std::string NameOf(Code code) { return fmt::format("MA{:04}", static_cast<unsigned>(code)); }

std::string_view NameOf(Severity severity) {
  switch (severity) {
    case Severity::Note:
      return "note";
    case Severity::Warning:
      return "warning";
    default:
      return "error";
  }
}

}  // namespace diag
