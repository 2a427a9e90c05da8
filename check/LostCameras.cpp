// Cameras and locators that do not come over, and what a composition has no place for.
#include <string>

#include "check/RulesInternal.h"
#include "scene/SpecialNames.h"

namespace check {
namespace {

using diag::Code;
using scene::NodeId;

bool IsOn(const scene::Scene& scene, NodeId node, std::string_view attribute) {
  const auto written = scene.Written(node, attribute);
  return (written && written->IsOn()) || scene.SourceOf(scene.PlugOf(node, attribute));
}

bool HasImagePlane(const scene::Scene& scene, NodeId camera) {
  for (const scene::Connection* const connection : scene.ConnectionsInto(camera)) {
    if (connection->destination.attribute == "ip" || connection->destination.attribute == "imagePlane")
      return true;
  }
  return false;
}

void ReportAttributes(const Subject& subject, NodeId camera) {
  std::string attributes;
  const auto add = [&attributes](const char* what) {
    attributes += (attributes.empty() ? "" : ", ") + std::string(what);
  };
  if (IsOn(subject.scene, camera, "dof") || IsOn(subject.scene, camera, "depthOfField"))
    add("the depth of field");
  if (HasImagePlane(subject.scene, camera)) add("the image plane");
  if (subject.scene.SourceOf(subject.scene.PlugOf(camera, "visibility"))) add("the visibility");
  if (attributes.empty()) return;
  const scene::Node& node = subject.scene.node(camera);
  subject.diagnostics.Report(Code::AttributesWithoutPlace, node.place, {node.name, attributes});
}

void ReportCameras(const Subject& subject) {
  std::size_t startup = 0;
  const scene::Node* firstStartup = nullptr;
  for (const Camera& camera : subject.cameras) {
    const scene::Node& node = subject.scene.node(camera.shape);
    if (camera.layer != nullptr || (camera.taken && subject.cameOver.stop != Stop::None)) {
      ReportAttributes(subject, camera.shape);
      // The importer knows an orthographic camera by one word alone: with another one it comes over.
      if (subject.scene.Number(camera.shape, "orthographic").value_or(0.0) != 0.0)
        subject.diagnostics.Report(Code::OrthographicAsPerspective, node.place, {node.name});
    } else if (scene::IsStartupCamera(node)) {
      if (startup++ == 0) firstStartup = &node;
    } else if (subject.scene.Number(camera.shape, "orthographic").value_or(0.0) != 0.0) {
      subject.diagnostics.Report(Code::OrthographicCamera, node.place, {node.name});
    } else {
      subject.diagnostics.Report(Code::CameraNotImported, node.place, {node.name});
    }
  }
  if (startup == 0) return;
  subject.diagnostics.Report(Code::StartupCameras, firstStartup->place, {std::to_string(startup)});
}

// Nothing comes over, which no other rule says.
void ReportNoCamera(const Subject& subject) {
  const std::vector<NodeId> locators = FindMarkedLocators(subject.scene);
  if (locators.empty()) return subject.diagnostics.Report(Code::NoCameraToImport, {});
  subject.diagnostics.Report(Code::LocatorsWithoutCamera, subject.scene.node(locators.front()).place,
                             {std::to_string(locators.size())});
}

void ReportLocators(const Subject& subject) {
  std::size_t unmarked = 0;
  const scene::Node* first = nullptr;
  for (const scene::Node& node : subject.scene.nodes()) {
    if (node.origin != scene::Origin::Created || !SameName(node.type, "locator")) continue;
    if (scene::IsMarked(ImportName(subject.scene, node))) continue;
    if (unmarked++ == 0) first = &node;
  }
  if (unmarked != 0) {
    subject.diagnostics.Report(Code::LocatorsLeftOut, first->place, {std::to_string(unmarked)});
  }
}

}  // namespace

void ReportLostCameras(const Subject& subject) {
  ReportCameras(subject);
  ReportLocators(subject);
  if (subject.cameOver.stop == Stop::None && subject.cameOver.layers.empty()) ReportNoCamera(subject);
}

}  // namespace check
