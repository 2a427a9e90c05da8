#include "check/PathText.h"

#include <cstddef>

namespace check {

std::string PathText(const scene::Scene& scene, scene::NodeId node) {
  constexpr std::size_t kLongest = 1000;
  std::string path;
  for (; node != scene::kNoNode && path.size() <= kLongest; node = scene.node(node).parent) {
    const scene::Node& one = scene.node(node);
    const bool created = one.origin == scene::Origin::Created;
    const bool barBefore = created || one.parent != scene::kNoNode;
    path.insert(0, (barBefore ? "|" : "") + std::string(one.name.substr(0, kLongest)));
  }
  if (path.size() <= kLongest) return path;
  return "..." + path.substr(path.size() - kLongest);
}

}  // namespace check
