// The report of a bake as JSON.
#pragma once

#include <ostream>
#include <vector>

#include "tools/mayascene/Diagnostics.h"
#include "tools/mayascene/OutputFile.h"
#include "tools/mayascene/SceneBake.h"

namespace mayascene {

// docs/bake-report.schema.json describes it.
void writeBakeReport(std::ostream& out, const std::vector<BakedScene>& scenes);

// Writes the report and commits its output. CannotWrite, with a complaint, where that fails.
ExitStatus commitBakeReport(OutputFile* output, const std::vector<BakedScene>& scenes,
                            Diagnostics& diagnostics);

}  // namespace mayascene
