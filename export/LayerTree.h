// The layers as a tree, from the top down. A description has only the way up, from a layer to its parent.
#pragma once

#include <cstddef>
#include <limits>
#include <vector>

#include "export/Composition.h"

namespace interchange {

// Layers without a parent, and the children of each layer, in the order of the layers.
class LayerTree {
 public:
  static constexpr std::size_t kNone = std::numeric_limits<std::size_t>::max();

  // Of a writable composition.
  explicit LayerTree(const Composition& composition);

  // kNone where there is no such layer.
  std::size_t FirstRoot() const { return firstRoot_; }
  std::size_t FirstChild(std::size_t layer) const { return firstChild_[layer]; }
  std::size_t NextSibling(std::size_t layer) const { return nextSibling_[layer]; }

  // All layers, each after its parent.
  std::vector<std::size_t> ParentsFirst() const;

 private:
  std::size_t firstRoot_ = kNone;
  std::vector<std::size_t> firstChild_;
  std::vector<std::size_t> nextSibling_;
};

}  // namespace interchange
