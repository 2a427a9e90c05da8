// The transforms above the written cameras and locators, each once.
#pragma once

#include <cstddef>
#include <cstdint>
#include <limits>
#include <string>
#include <unordered_map>
#include <vector>

#include "bake/Sampler.h"
#include "scene/Scene.h"

namespace bake {

struct Link {
  static constexpr std::uint32_t kNone = std::numeric_limits<std::uint32_t>::max();

  scene::NodeId node = scene::kNoNode;
  std::uint32_t above = kNone;  // the link of its parent
  std::size_t track = 0;        // of the node against its parent
  bool cutOff = false;          // a node above it is not in the file, or its inheritance can change

  // True when it holds for the link and for all those above it. Known after Judge.
  bool finite = true;
  bool square = true;    // without shear
  bool unscaled = true;  // scale 1, and not mirrored

  bool moves = false;              // it, or one above it. Known after Judge.
  std::vector<motion::Kept> kept;  // of it and of all those above it, as KeptBelow counts. Known after Judge.

  std::string name;  // in the bake; empty until it is written
};

class Chains {
 public:
  explicit Chains(const scene::Scene& scene) : scene_(scene) {}

  // The link of a transform; those above it are added too, up to a node that does not inherit transforms.
  // kNone for kNoNode. The same transform has the same link.
  std::uint32_t Add(scene::NodeId transform);

  // Asks for a track of each link.
  void AskFor(Sampler* sampler);

  // Sets the properties of the links from their tracks, after the sampler has run.
  void Judge(Sampler* sampler, const motion::KeptBelow& below);

  Link& link(std::uint32_t index) { return links_[index]; }
  const std::vector<Link>& links() const { return links_; }

 private:
  const scene::Scene& scene_;
  std::vector<Link> links_;  // a link comes after those above it
  std::unordered_map<scene::NodeId, std::uint32_t> linkOfNode_;
};

}  // namespace bake
