// Why the import stopped, and where.
#include <algorithm>
#include <cstddef>
#include <string>

#include "check/RulesInternal.h"

namespace check {
namespace {

using diag::Code;

// The text of a line, without its end. Empty for a line that the text does not have.
diag::Range LineOf(std::string_view text, std::uint64_t line) {
  std::size_t start = 0;
  for (; line > 1; --line) {
    const std::size_t end = text.find('\n', start);
    if (end == std::string_view::npos) return {text.size(), 0};
    start = end + 1;
  }
  const std::size_t end = std::min(text.find_first_of("\r\n", start), text.size());
  return {start, end - start};
}

}  // namespace

void ReportStop(std::string_view text, const CameOver& cameOver, diag::Collector* diagnostics) {
  if (cameOver.stop == Stop::None) return;
  const diag::Range range = cameOver.line == 0 ? diag::Range{} : LineOf(text, cameOver.line);
  if (cameOver.stop == Stop::NotAScene) return diagnostics->Report(Code::NotMayaAscii, {});
  diagnostics->Report(Code::ImportStopped, range, {std::to_string(cameOver.code), cameOver.sentence});
}

}  // namespace check
