// The cameras of a scene, and the layers that the import made of them.
#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "check/CameOver.h"
#include "scene/Scene.h"
#include "scene/SpecialNames.h"

namespace check {

struct Camera {
  scene::NodeId shape = scene::kNoNode;
  scene::NodeId transform = scene::kNoNode;  // kNoNode: nothing stands above the camera
  const CameOverLayer* layer = nullptr;      // null: none came over
  bool taken = false;                        // the importer makes a layer of such a camera
};

// Each camera that the file creates, in its order.
std::vector<Camera> FindCameras(const scene::Scene& scene, const CameOver& cameOver);

using scene::ImportName;

// Whether the importer keeps nodes of the type as transforms.
bool IsImportedTransform(std::string_view type);

// Whether two names are one for the importer: it does not look at case.
bool SameName(std::string_view a, std::string_view b);

}  // namespace check
