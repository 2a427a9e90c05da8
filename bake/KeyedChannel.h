// A channel that a curve drives directly, as an import finds it.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

#include "motion/CurveData.h"
#include "motion/Measures.h"
#include "scene/Scene.h"

namespace bake {

struct KeyedChannel {
  std::string_view attribute;  // of the node that is driven
  scene::NodeId node;          // the curve's
  motion::CurveData curve;     // with at least one key
};

// None where something else drives the channel, or nothing.
std::optional<KeyedChannel> FindKeys(const scene::Scene& scene, scene::NodeId node,
                                     std::string_view attribute, const motion::Measures& measures);

// The node's own name between quotes, escaped for a terminal; of a very long one the beginning.
std::string ShownNode(const scene::Scene& scene, scene::NodeId node);

}  // namespace bake
