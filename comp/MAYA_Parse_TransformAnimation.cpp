// Keys of a node's position, rotation and scale: for every sampled key the node's matrix is rebuilt, taken
// apart and written to five streams. Reads `curves` and the units; keys go through MAYA_Parse_Streams.cpp.
#include <cstring>

#include "comp/Conversions.h"
#include "comp/UnwrapAngle.h"
#include "hostapi/LayerStreams.h"
#include "maya/MAYA_Parse.h"
#include "plugin/Guarded.h"

namespace mayaimport {

namespace {

// The animated streams, in the order in which their batches are opened, filled and closed.
enum Batch : std::size_t { kScaleBatch, kXBatch, kYBatch, kZBatch, kPositionBatch, kBatchCount };
constexpr LayerStreamId kBatchStreams[kBatchCount] = {HOST_STREAM_SCALE, HOST_STREAM_ROTATION_X,
                                                      HOST_STREAM_ROTATION_Y, HOST_STREAM_ROTATION_Z,
                                                      HOST_STREAM_POSITION};

}  // namespace

void MAYA_Parse::ApplyTransformAnimation(VOR_Layer* layer, const MAYA_Transform* node) {
  const std::int32_t keyCount = VerifyAnimInfo(node);
  if (keyCount < 1) return;

  VOR_AddKeyframesInfo* batches[kBatchCount] = {};
  HostError kept = Guarded([&] {
    for (std::size_t i = 0; i < kBatchCount; ++i) StartAddingKeyframes(layer, kBatchStreams[i], &batches[i]);
    InsertTransformKeys(layer, *node, keyCount, batches);
  });
  for (VOR_AddKeyframesInfo* const batch : batches) {
    if (batch != nullptr) KeepFirst(&kept, Guarded([&] { EndAddingKeyframes(batch); }));
  }
  ThrowOnError(kept);
}

void MAYA_Parse::InsertTransformKeys(VOR_Layer* layer, const MAYA_Transform& node, std::int32_t keyCount,
                                     VOR_AddKeyframesInfo* const* batches) {
  PivotedTransform transform = ConvertPivots(node);
  ChannelValues still;
  CopyChannels(node, still);
  ChannelValues values;
  double previous[kAxisCount] = {};
  for (std::int32_t n = 0; n < keyCount; ++n) {
    const T_Time time = GetKeyTime(&node, n);
    std::memcpy(values, still, sizeof values);
    for (const int group : {kScaleGroup, kRotateGroup, kTranslateGroup}) {
      ExtractAnimInfo(&node, group, n, values[group]);
    }
    const MatrixComponents at = DecomposeTransform(&transform, values);
    double angles[kAxisCount];
    for (int axis = 0; axis < kAxisCount; ++axis) {
      angles[axis] = n > 0 ? UnwrapAngle(at.rotation[axis], previous[axis]) : at.rotation[axis];
      previous[axis] = angles[axis];
    }
    InsertThreeDKeyframe(batches[kScaleBatch], layer, HOST_STREAM_SCALE, &time, at.scale[0] * kPercent,
                         at.scale[1] * kPercent, at.scale[2] * kPercent);
    InsertOneDKeyframe(batches[kXBatch], layer, HOST_STREAM_ROTATION_X, &time, angles[0] * kRadiansToDegrees);
    InsertOneDKeyframe(batches[kYBatch], layer, HOST_STREAM_ROTATION_Y, &time, angles[1] * kRadiansToDegrees);
    InsertOneDKeyframe(batches[kZBatch], layer, HOST_STREAM_ROTATION_Z, &time, angles[2] * kRadiansToDegrees);
    InsertThreeDKeyframe(batches[kPositionBatch], layer, HOST_STREAM_POSITION, &time, at.translation[0],
                         at.translation[1], at.translation[2]);
  }
}

}  // namespace mayaimport
