// Aiming a camera at the target of a constraint. Reads `transforms` and `curves`; calls the layer suite, keys
// and values go through MAYA_Parse_Streams.cpp.
#include <algorithm>
#include <iterator>

#include "hostapi/LayerStreams.h"
#include "hostapi/LayerSuite.h"
#include "maya/ListAccess.h"
#include "maya/MAYA_Parse.h"
#include "maya/Words.h"
#include "plugin/Guarded.h"

namespace mayaimport {

bool MAYA_Parse::SetCameraLookAt(VOR_Layer* layer, const MAYA_Camera* camera,
                                 const MAYA_Transform* constraint) {
  const auto turned = FetchRecord<MAYA_Transform>(transforms, constraint->curve[kConstrainedSlot]);
  if (!SameWord(turned.name, camera->parent)) return false;
  const auto target = FetchRecord<MAYA_Transform>(transforms, constraint->curve[kTargetSlot]);
  SetAnchorPoint(layer, &target);
  ApplyAnchorPointAnimation(layer, &target);
  return true;
}

void MAYA_Parse::ApplyAnchorPointAnimation(VOR_Layer* layer, const MAYA_Transform* node) {
  const std::int32_t keyCount = VerifyAnimInfo(node);
  if (keyCount < 1) return;

  VOR_AddKeyframesInfo* batch = nullptr;
  HostError kept = Guarded([&] {
    StartAddingKeyframes(layer, HOST_STREAM_ANCHOR_POINT, &batch);
    for (std::int32_t n = 0; n < keyCount; ++n) {
      const T_Time time = GetKeyTime(node, n);
      double point[kAxisCount];
      std::copy(std::begin(node->translate), std::end(node->translate), point);
      ExtractAnimInfo(node, kTranslateGroup, n, point);
      InsertThreeDKeyframe(batch, layer, HOST_STREAM_ANCHOR_POINT, &time, ConvertDist(point[0]),
                           -ConvertDist(point[1]), -ConvertDist(point[2]));
    }
  });
  if (batch != nullptr) KeepFirst(&kept, Guarded([&] { EndAddingKeyframes(batch); }));
  ThrowOnError(kept);
}

void MAYA_Parse::SetAnchorPoint(VOR_Layer* layer, const MAYA_Transform* node) {
  constexpr std::uint8_t kOn = 1;
  ThrowOnError(LayerSuite10().SetLayerFlag(layer, HOST_LAYER_FLAG_AIMED, kOn));
  SetThreeDStream(layer, HOST_STREAM_ANCHOR_POINT, ConvertDist(node->translate[0]),
                  -ConvertDist(node->translate[1]), -ConvertDist(node->translate[2]));
}

}  // namespace mayaimport
