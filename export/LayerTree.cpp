#include "export/LayerTree.h"

namespace interchange {

LayerTree::LayerTree(const Composition& composition)
    : firstChild_(composition.layers.size(), kNone), nextSibling_(composition.layers.size(), kNone) {
  // From the last to the first, so that each comes before those that it is put in front of.
  for (std::size_t layer = composition.layers.size(); layer-- > 0;) {
    const std::optional<std::size_t>& parent = composition.layers[layer].parent;
    std::size_t& first = parent ? firstChild_[*parent] : firstRoot_;
    nextSibling_[layer] = first;
    first = layer;
  }
}

}  // namespace interchange
