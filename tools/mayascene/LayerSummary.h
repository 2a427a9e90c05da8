// A layer in one line: its lens, what moves, and over which frames.
#pragma once

#include <string>

#include "refhost/Project.h"

namespace mayascene {

// For a camera "lens 21 to 35 mm   zoom, position animated, frames 0 to 92"; "still" where nothing is
// animated. Keys of one value do not count as animation. The layer belongs to a composition.
std::string layerSummary(const refhost::Layer& layer);

}  // namespace mayascene
