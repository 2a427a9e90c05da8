// The transforms that a camera, its aim or a marked locator depends on.
#pragma once

#include <string_view>
#include <vector>

#include "check/Cameras.h"
#include "scene/Scene.h"

namespace check {

struct Link {
  scene::NodeId node = scene::kNoNode;   // a node that the file creates
  scene::NodeId shape = scene::kNoNode;  // the first camera or locator below it, in the order of the file
  bool own = false;                      // it is the transform of that shape
  bool ofCamera = false;                 // the shape is a camera
  bool target = false;                   // the camera looks at it; no more than its translation is taken
};

// Stands for a node of another file.
bool IsFosterParent(const scene::Node& node);

// Why the importer has no layer for what a node stands under.
enum class ParentLoss {
  None,         // it has one, or the node stands under nothing
  Path,         // the file names the parent by a path
  Elsewhere,    // the file does not create it
  NotImported,  // it is no transform
  Command,      // a parent command gives the node another one
};

ParentLoss ParentLossOf(const scene::Scene& scene, const scene::Node& node);

// What stands in quotes after "-p" in the command that created the node; empty where it is not found.
diag::Range WrittenParent(std::string_view text, const scene::Node& node);

// The marked locators that the file creates, in its order.
std::vector<scene::NodeId> FindMarkedLocators(const scene::Scene& scene);

// Those of the cameras that the importer takes, of the locators, and what the cameras look at, each once:
// from the shape's own upwards, as far as the importer has layers, of a target itself alone.
std::vector<Link> FindLinks(const scene::Scene& scene, const std::vector<Camera>& cameras,
                            const std::vector<scene::NodeId>& locators);

}  // namespace check
