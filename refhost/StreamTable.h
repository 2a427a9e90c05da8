// The streams that a layer has from its creation: names, dimensions and defaults.
#pragma once

#include <cstdint>
#include <vector>

#include "refhost/Project.h"

namespace refhost {

// The streams of a layer of that kind, in the order of their numbers, with the defaults that do not depend on
// the composition.
std::vector<Stream> makeStreams(LayerKind kind);

// "position"; a camera's anchor point is its "point of interest".
const char* streamName(int32_t id, LayerKind kind);

}  // namespace refhost
