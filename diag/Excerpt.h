// The line that a diagnostic is about, with a mark under the exact text.
#pragma once

#include <string>
#include <string_view>

#include "diag/Diagnostic.h"

namespace diag {

// Two lines with line ends: what stands in the text, and "^~~~" under the range. The range's first line is
// shown; a mark ends with it. A long line is cut around the mark, with "..." for what is left out. Harmless
// on a terminal: escapes take the place of what would move the cursor, and the mark is as long as they are.
// Empty where the range has no line to show: it lies beyond the text.
std::string Excerpt(std::string_view text, const Range& range);

}  // namespace diag
