// The result of an import, for a person to read.
#pragma once

#include <ostream>

#include "tools/mayascene/Report.h"
#include "tools/mayascene/TerminalText.h"

namespace mayascene {

enum class Detail {
  Layers,      // a line each: its lens, what is animated, and over which frames
  Properties,  // and below it a line for each property, with its value and keys
};

// The compositions of the scene's folder, their layers in order as a tree of parents, then the messages that
// the host showed. Names and messages are escaped.
void printOutline(std::ostream& out, const SceneReport& scene, Detail detail, const Style& style);

}  // namespace mayascene
