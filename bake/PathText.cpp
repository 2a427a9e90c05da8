#include "bake/PathText.h"

#include <cstddef>
#include <vector>

namespace bake {

std::string PathText(const scene::Scene& scene, scene::NodeId node) {
  constexpr std::size_t kLongest = 1'000;
  std::vector<scene::NodeId> chain;
  std::size_t length = 0;
  scene::NodeId at = node;
  while (at != scene::kNoNode && length <= kLongest) {
    length += scene.node(at).name.size() + 1;
    chain.push_back(at);
    at = scene.node(at).parent;
  }
  if (at == scene::kNoNode && length <= kLongest) return scene.PathOf(node);
  std::string path = "...";
  if (length > kLongest && chain.size() > 1) chain.pop_back();
  for (auto one = chain.rbegin(); one != chain.rend(); ++one) {
    path += '|';
    path += scene.node(*one).name.substr(0, kLongest);
  }
  return path;
}

}  // namespace bake
