// A transform in the host's space: scene points (x, y, z) become (x, -y, -z), angles about Y and Z change
// sign, and the pivots are folded into the position. Reads the units; sets streams through
// MAYA_Parse_Streams.cpp.
#include "comp/Conversions.h"
#include "hostapi/LayerStreams.h"
#include "maya/MAYA_Parse.h"
#include "plugin/ErrorCodes.h"

namespace mayaimport {

void MAYA_Parse::ConvertPoint(const double* point, double (&host)[kAxisCount]) const {
  host[0] = ConvertDist(point[0]);
  host[1] = -ConvertDist(point[1]);
  host[2] = -ConvertDist(point[2]);
}

PivotedTransform MAYA_Parse::ConvertPivots(const MAYA_Transform& node) const {
  PivotedTransform pivots{};
  ConvertPoint(node.scalePivot, pivots.scalePivot);
  ConvertPoint(node.rotatePivot, pivots.rotatePivot);
  return pivots;
}

void MAYA_Parse::CopyChannels(const MAYA_Transform& node, ChannelValues& values) {
  for (int axis = 0; axis < kAxisCount; ++axis) {
    values[kTranslateGroup][axis] = node.translate[axis];
    values[kRotateGroup][axis] = node.rotate[axis];
    values[kScaleGroup][axis] = node.scale[axis];
  }
}

// Fills in the channels beside the pivots, and takes the whole apart.
MatrixComponents MAYA_Parse::DecomposeTransform(PivotedTransform* transform,
                                                const ChannelValues& values) const {
  const auto& rotate = values[kRotateGroup];
  for (int axis = 0; axis < kAxisCount; ++axis) transform->scale[axis] = values[kScaleGroup][axis];
  // Deliberate: always about X, then Y, then Z; the node's own rotate order is not looked at.
  transform->rotation[0] = ConvertRot(rotate[0]) * kDegreesToRadians;
  transform->rotation[1] = ConvertRot(rotate[1]) * -kDegreesToRadians;
  transform->rotation[2] = ConvertRot(rotate[2]) * -kDegreesToRadians;
  ConvertPoint(values[kTranslateGroup], transform->translation);
  MatrixComponents components;
  ThrowOnError(MatrixDecomposePivoted(transform, &components));
  return components;
}

void MAYA_Parse::SetTransform(VOR_Layer* layer, const MAYA_Transform* node) {
  ChannelValues values;
  CopyChannels(*node, values);
  PivotedTransform transform = ConvertPivots(*node);
  const MatrixComponents at = DecomposeTransform(&transform, values);
  SetThreeDStream(layer, HOST_STREAM_ANCHOR_POINT, 0.0, 0.0, 0.0);
  SetThreeDStream(layer, HOST_STREAM_SCALE, at.scale[0] * kPercent, at.scale[1] * kPercent,
                  at.scale[2] * kPercent);
  SetOneDStream(layer, HOST_STREAM_ROTATION_X, at.rotation[0] * kRadiansToDegrees);
  SetOneDStream(layer, HOST_STREAM_ROTATION_Y, at.rotation[1] * kRadiansToDegrees);
  SetOneDStream(layer, HOST_STREAM_ROTATION_Z, at.rotation[2] * kRadiansToDegrees);
  SetThreeDStream(layer, HOST_STREAM_POSITION, at.translation[0], at.translation[1], at.translation[2]);
}

}  // namespace mayaimport
