// The head of a check's report, for a person to read.
#pragma once

#include <ostream>

#include "tools/mayascene/SceneCheck.h"
#include "tools/mayascene/TerminalText.h"

namespace mayascene {

// A few lines, and an empty one. Long lists are cut and counted, unless `all`. Text from the scene is
// escaped.
void printHead(std::ostream& out, const CheckedScene& scene, bool all, const Style& style);

}  // namespace mayascene
