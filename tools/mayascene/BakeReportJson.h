// The report of a bake as JSON.
#pragma once

#include <ostream>
#include <vector>

#include "tools/mayascene/SceneBake.h"

namespace mayascene {

// docs/bake-report.schema.json describes it.
void writeBakeReport(std::ostream& out, const std::vector<BakedScene>& scenes);

}  // namespace mayascene
