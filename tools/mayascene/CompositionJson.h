// A run's compositions, values and keys as JSON: the form that docs/composition-json.md describes.
#pragma once

#include <ostream>

#include "tools/mayascene/Report.h"

namespace mayascene {

void writeCompositionJson(std::ostream& out, const RunReport& run);

}  // namespace mayascene
