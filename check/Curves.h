// Which curves drive the channels of a node directly, as the importer finds them.
#pragma once

#include <cstddef>
#include <span>
#include <string_view>
#include <vector>

#include "scene/Scene.h"

namespace check {

struct KeyedChannel {
  std::string_view channel;
  scene::NodeId curve = scene::kNoNode;
  std::size_t keys = 0;  // numbers of the file, in pairs
  double first = 0.0;    // the first and the last key's time, as it is written; 0 without keys
  double last = 0.0;
  double firstValue = 0.0;  // of the first key
  bool whole = true;        // a key at every frame from the first to the last
  bool fractional = false;  // a key lies at a fraction of a frame
  double fraction = 0.0;    // the first that does
  diag::Range place;        // of the first keys
};

// In the order of the channels; only curves of times, which a path does not hide from the importer.
std::vector<KeyedChannel> FindKeyedChannels(const scene::Scene& scene, scene::NodeId node,
                                            std::span<const std::string_view> channels);

// Whether the importer makes a curve of the type.
bool IsImportedCurve(std::string_view type);

// Whether the importer finds the node of a plug: it looks for names, and a path is none.
bool IsPath(const scene::Scene& scene, const diag::Range& plug);

}  // namespace check
