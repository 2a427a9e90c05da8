// What an import made, for a person to read.
#pragma once

#include <ostream>

#include "tools/mayascene/Report.h"
#include "tools/mayascene/TerminalText.h"

namespace mayascene {

// The compositions of the scene's folder, their layers in order as a tree of parents with values and keys,
// then the messages that the host showed. Names and messages are escaped.
void printOutline(std::ostream& out, const SceneReport& scene, const Style& style);

}  // namespace mayascene
