// Which curves drive the channels of a node directly, as the importer finds them.
#pragma once

#include <cstddef>
#include <span>
#include <string_view>
#include <unordered_map>
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
  double fraction = 0.0;    // the first that does, in frames
  bool crowded = false;     // keys may land on one time of the composition: they lie close, or go back
  diag::Range place;        // of the first keys
};

// What drives one of the channels.
struct DrivenChannel {
  std::string_view channel;
  scene::Driver driver;
};

// Finds what drives the channels of a node and reads the keys of its curves, once for all rules that ask.
class Channels {
 public:
  explicit Channels(const scene::Scene& scene);

  // Of the nine channels, in their order. It lasts as long as the object, as the next two do.
  std::span<const DrivenChannel> DriversOf(scene::NodeId node) { return Of(node).drivers; }

  // The same, but only curves of times, which a path does not hide from the importer.
  std::span<const KeyedChannel> KeyedOf(scene::NodeId node) { return Of(node).keyed; }

  // Of a camera's focal length: one or none.
  std::span<const KeyedChannel> LensOf(scene::NodeId camera);

 private:
  struct Found {
    std::vector<DrivenChannel> drivers;
    std::vector<KeyedChannel> keyed;
  };

  const Found& Of(scene::NodeId node);
  Found Find(scene::NodeId node, std::span<const std::string_view> channels);
  const KeyedChannel& KeysOf(scene::NodeId curve);

  const scene::Scene& scene_;
  double unitsPerFrame_;
  std::unordered_map<scene::NodeId, Found> places_;
  std::unordered_map<scene::NodeId, Found> lenses_;
  std::unordered_map<scene::NodeId, KeyedChannel> curves_;  // of no channel
};

// Whether the importer makes a curve of the type.
bool IsImportedCurve(std::string_view type);

// Whether the importer finds the node of a plug: it looks for names, and a path is none.
bool IsPath(const scene::Scene& scene, const diag::Range& plug);

}  // namespace check
