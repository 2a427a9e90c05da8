// A layer in one line: its lens, and what of it moves when.
#pragma once

#include <string>

#include "refhost/Project.h"

namespace mayascene {

// Of a camera "lens 21 to 35 mm   zoom, position animated, frames 0 to 92"; "still" where nothing is
// animated. Keys that all hold one value animate nothing. The layer belongs to a composition.
std::string layerSummary(const refhost::Layer& layer);

}  // namespace mayascene
