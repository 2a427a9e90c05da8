// The head of a check's report, for a person to read.
#pragma once

#include <ostream>

#include "tools/mayascene/SceneCheck.h"
#include "tools/mayascene/TerminalText.h"

namespace mayascene {

// A few lines, and an empty one. What comes out of the scene is made harmless.
void printHead(std::ostream& out, const CheckedScene& scene, const Style& style);

}  // namespace mayascene
