// The cameras of a scene, and the layers that the import made of them.
#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "check/CameOver.h"
#include "scene/Scene.h"

namespace check {

struct Camera {
  scene::NodeId shape = scene::kNoNode;
  scene::NodeId transform = scene::kNoNode;  // kNoNode: nothing stands above the camera
  const CameOverLayer* layer = nullptr;      // null: none came over
  bool taken = false;                        // the importer makes a layer of such a camera
};

// Each camera that the file creates, in its order.
std::vector<Camera> FindCameras(const scene::Scene& scene, const CameOver& cameOver);

// The name by which the importer knows a node: as createNode has it, in quotes. Empty for any other node, and
// for one whose name is too long for the importer.
std::string_view ImportName(const scene::Scene& scene, const scene::Node& node);

// Whether the importer keeps nodes of the type as transforms.
bool IsImportedTransform(std::string_view type);

// Whether two names are one for the importer: it does not look at case.
bool SameName(std::string_view a, std::string_view b);

}  // namespace check
