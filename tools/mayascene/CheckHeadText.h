// The head of a check's report, for a person to read.
#pragma once

#include <ostream>

#include "tools/mayascene/SceneCheck.h"
#include "tools/mayascene/TerminalText.h"

namespace mayascene {

// A few lines, and an empty one; long lists are cut and counted unless all is asked for. What comes out of
// the scene is made harmless.
void printHead(std::ostream& out, const CheckedScene& scene, bool all, const Style& style);

}  // namespace mayascene
