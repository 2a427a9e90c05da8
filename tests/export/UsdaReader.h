// A reader of USD's text of the tests' own, for what a writer of cameras and transforms can write. Throws
// Broken where the text is none, or breaks a rule.
#pragma once

#include <string_view>

#include "tests/export/SeenScene.h"

namespace exporttest {

// Layers are the prims that transform, in the order of the text, with the names that their customData keep;
// a camera is a prim below its layer's, in the host's axes turned about x by half a turn. Times are time
// codes; places are in units of the stage.
SeenScene ReadUsda(std::string_view text, bool hostAxes = false);

}  // namespace exporttest
