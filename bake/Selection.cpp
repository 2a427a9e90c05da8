#include "bake/Selection.h"

#include <algorithm>
#include <array>
#include <string>

#include "scene/SpecialNames.h"

namespace bake {
namespace {

using scene::NodeId;

constexpr std::array<std::string_view, 2> kCameraTypes = {"camera", "stereoRigCamera"};

bool IsCamera(std::string_view type) {
  return std::find(kCameraTypes.begin(), kCameraTypes.end(), type) != kCameraTypes.end();
}

// A name of the command line: a node's own name, or its whole path. The topmost node of a path that begins
// without a "|" is from elsewhere.
bool Names(const scene::Scene& scene, NodeId id, std::string_view wanted) {
  if (id == scene::kNoNode) return false;
  if (scene.node(id).name == wanted) return true;
  if (wanted.find('|') == std::string_view::npos || !wanted.ends_with(scene.node(id).name)) return false;
  return scene.PathOf(id, wanted.size()) == wanted;
}

bool IsWanted(const scene::Scene& scene, NodeId camera, const Options& options, std::vector<bool>* found) {
  bool wanted = options.cameras.empty();
  for (std::size_t i = 0; i < options.cameras.size(); ++i) {
    const std::string& name = options.cameras[i];
    if (!Names(scene, camera, name) && !Names(scene, scene.node(camera).parent, name)) continue;
    (*found)[i] = true;
    wanted = true;
  }
  return wanted;
}

void SelectLocator(NodeId id, std::string_view name, const Options& options, Selection* selection) {
  if (options.locators == Locators::kAll ||
      (options.locators == Locators::kMarked && scene::IsMarked(name))) {
    selection->locators.push_back(id);
  } else if (options.locators == Locators::kMarked) {
    ++selection->locatorsLeftOut;
  }
}

}  // namespace

bool IsSetUp(const scene::Scene& scene, NodeId id) {
  const scene::Node& node = scene.node(id);
  if (node.origin != scene::Origin::Created || !IsCamera(node.type)) return false;
  return !scene::IsStartupCamera(node) && scene.Number(id, "orthographic").value_or(0.0) == 0.0;
}

Selection Select(const scene::Scene& scene, const Options& options, diag::Collector* diagnostics) {
  Selection selection;
  std::vector<bool> found(options.cameras.size(), false);
  for (NodeId id = 0; id < scene.nodes().size(); ++id) {
    const scene::Node& node = scene.node(id);
    if (node.type == "locator" && node.origin == scene::Origin::Created) {
      SelectLocator(id, node.name, options, &selection);
    } else if (IsSetUp(scene, id) && IsWanted(scene, id, options, &found)) {
      selection.cameras.push_back(id);
    }
  }
  for (std::size_t i = 0; i < found.size(); ++i) {
    if (!found[i]) diagnostics->Report(diag::Code::CameraNotFound, {}, {options.cameras[i]});
  }
  return selection;
}

}  // namespace bake
