#include "export/LayerTree.h"

namespace interchange {

LayerTree::LayerTree(const Composition& composition)
    : firstChild_(composition.layers.size(), kNone), nextSibling_(composition.layers.size(), kNone) {
  // From the last to the first, because each layer is put in front of its siblings.
  for (std::size_t layer = composition.layers.size(); layer-- > 0;) {
    const std::optional<std::size_t>& parent = composition.layers[layer].parent;
    std::size_t& first = parent ? firstChild_[*parent] : firstRoot_;
    nextSibling_[layer] = first;
    first = layer;
  }
}

std::vector<std::size_t> LayerTree::ParentsFirst() const {
  std::vector<std::size_t> order;
  order.reserve(firstChild_.size());
  for (std::size_t root = firstRoot_; root != kNone; root = nextSibling_[root]) order.push_back(root);
  for (std::size_t done = 0; done < order.size(); ++done) {
    const std::size_t first = firstChild_[order[done]];
    for (std::size_t child = first; child != kNone; child = nextSibling_[child]) order.push_back(child);
  }
  return order;
}

}  // namespace interchange
