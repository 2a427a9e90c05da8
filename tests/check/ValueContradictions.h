// The channels of one layer against the curves of the node that it stands for.
#pragma once

#include <string>
#include <vector>

#include "check/CameOver.h"
#include "check/Check.h"
#include "tests/check/Author.h"
#include "tests/check/LayerContradictions.h"

namespace check_test {

struct Layered {
  scene::NodeId shape;  // the camera or locator at the foot of the chain
  scene::NodeId node;   // whose place the layer has; of an interest, the look-at
  const check::CameOverLayer& layer;
};

// Position, rotation, scale and, of the camera's own layer, zoom: static or animated, how many keys, when,
// and what they say.
std::string ValueContradiction(const Author& author, const check::Report& report, const Layered& layered,
                               Compared* compared);

// The point of interest of an aimed camera, against the place of the look-at's target.
std::string InterestContradiction(const Author& author, const check::Report& report, const Layered& layered,
                                  Compared* compared);

// Whether nodes that are keyed from different times all begin at time 0, and nothing is said.
std::string StartContradiction(const Author& author, const check::Report& report, scene::NodeId shape,
                               const std::vector<scene::NodeId>& places);

}  // namespace check_test
