// The report of a check, for a person to read.
#pragma once

#include <ostream>

#include "tools/mayascene/SceneCheck.h"
#include "tools/mayascene/TerminalText.h"

namespace mayascene {

struct ReportShape {
  bool quiet = false;  // errors alone
  bool all = false;    // the head without a cut
};

// The head, the diagnostics in the form that compilers use, and a last line with totals. Nothing for a file
// that could not be read. Text from the scene is escaped.
void printCheck(std::ostream& out, const CheckedScene& scene, const ReportShape& shape, const Style& style);

// "2 errors, 1 warning, no notes"
std::string totalsText(const check::Report& report);

}  // namespace mayascene
