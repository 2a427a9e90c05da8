// The layers of a composition: cameras, marked locators, and the nulls of the transforms above them. Reads
// the lists; calls the comp and layer suites.
#include <string_view>

#include "hostapi/CompSuite.h"
#include "hostapi/LayerSuite.h"
#include "maya/ListAccess.h"
#include "maya/MAYA_Parse.h"
#include "plugin/ErrorCodes.h"

namespace mayaimport {

namespace {

// Deliberate: these three spellings alone mark a locator. "nULL" does not.
bool IsMarked(std::string_view name) {
  return name.find("null") != std::string_view::npos || name.find("NULL") != std::string_view::npos ||
         name.find("Null") != std::string_view::npos;
}

}  // namespace

void MAYA_Parse::CreateCameraLayerAndKeyframes(VOR_CompItem* comp, const MAYA_Camera* camera) {
  VOR_Layer* layer = nullptr;
  ThrowOnError(CompSuite9().NewCameraLayer(camera->name, comp, HOST_CAMERA_CENTER_ANYWHERE,
                                           HOST_CAMERA_CENTER_ANYWHERE, &layer));
  SetCamera(layer, camera);
  ApplyCameraAnimation(layer, camera);
  const std::int32_t transform = transformNames_.Find(camera->parent);
  CreateParentNulls(comp, layer, transform);
  LookAtPass(layer, camera, transform);
}

void MAYA_Parse::CreateLocatorLayerAndKeyframes(VOR_CompItem* comp, const MAYA_Locator* locator) {
  if (!IsMarked(locator->name)) return;
  VOR_Layer* layer = nullptr;
  CreateLocator(locator, comp, &layer);
  CreateParentNulls(comp, layer, transformNames_.Find(locator->parent));
}

void MAYA_Parse::CreateLocator(const MAYA_Locator* locator, VOR_CompItem* comp, VOR_Layer** layer) {
  *layer = NewNull(comp, locator->name);
  const std::int32_t transform = transformNames_.Find(locator->parent);
  if (transform == kNoIndex) return;
  const auto record = FetchRecord<MAYA_Transform>(transforms, transform);
  SetTransform(*layer, &record);
  ApplyTransformAnimation(*layer, &record);
}

// One null for each transform above the given one, each the parent of the layer before. A name that names no
// transform still gives its null and ends the chain; a transform that the chain has used ends it without one.
void MAYA_Parse::CreateParentNulls(VOR_CompItem* comp, VOR_Layer* child, std::int32_t transform) {
  if (transform == kNoIndex) return;
  chainOfTransform_.resize(static_cast<std::size_t>(RecordCount(transforms)), 0);
  ++chain_;
  for (;;) {
    chainOfTransform_.at(static_cast<std::size_t>(transform)) = chain_;
    const auto below = FetchRecord<MAYA_Transform>(transforms, transform);
    if (below.parent[0] == '\0') return;
    transform = transformNames_.Find(below.parent);
    const bool found = transform != kNoIndex;
    if (found && chainOfTransform_.at(static_cast<std::size_t>(transform)) == chain_) return;

    VOR_Layer* const null = NewNull(comp, below.parent);
    ThrowOnError(LayerSuite10().SetLayerParent(child, null));
    if (!found) return;
    const auto record = FetchRecord<MAYA_Transform>(transforms, transform);
    SetTransform(null, &record);
    ApplyTransformAnimation(null, &record);
    child = null;
  }
}

VOR_Layer* MAYA_Parse::NewNull(VOR_CompItem* comp, const char* name) {
  constexpr T_Time kOwnLength{0, 0};
  constexpr std::uint8_t kOn = 1;
  VOR_Layer* layer = nullptr;
  ThrowOnError(CompSuite9().NewNullLayer(name, comp, &kOwnLength, &layer));
  ThrowOnError(LayerSuite10().SetLayerFlag(layer, HOST_LAYER_FLAG_3D, kOn));
  return layer;
}

// Aims the camera by the first constraint, in list order, that has all its links and turns the camera's
// transform.
void MAYA_Parse::LookAtPass(VOR_Layer* layer, const MAYA_Camera* camera, std::int32_t transform) {
  if (transform == kNoIndex) return;
  if (constraintOfTransform_.empty()) CollectConstraints();
  const std::int32_t constraint = constraintOfTransform_.at(static_cast<std::size_t>(transform));
  if (constraint == kNoIndex) return;
  const auto record = FetchRecord<MAYA_Transform>(transforms, constraint);
  SetCameraLookAt(layer, camera, &record);
}

// Finds the first complete constraint of each transform that one turns. Done once, so that the time does not
// grow with cameras times transforms.
void MAYA_Parse::CollectConstraints() {
  const std::int64_t count = RecordCount(transforms);
  std::vector<std::int32_t> constraints(static_cast<std::size_t>(count), kNoIndex);
  for (std::int64_t i = 0; i < count; ++i) {
    const auto record = FetchRecord<MAYA_Transform>(transforms, i);
    const std::int32_t turned = record.curve[kConstrainedSlot];
    if (turned < 0 || record.curve[kFollowedSlot] < 0 || record.curve[kTargetSlot] < 0) continue;
    std::int32_t& first = constraints.at(static_cast<std::size_t>(turned));
    if (first == kNoIndex) first = static_cast<std::int32_t>(i);
  }
  constraintOfTransform_ = std::move(constraints);
}

}  // namespace mayaimport
