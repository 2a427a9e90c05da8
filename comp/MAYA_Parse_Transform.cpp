// A transform in the host's space: scene points (x, y, z) become (x, -y, -z), angles about Y and Z change
// sign, and the pivots are folded into the position. Reads the units; sets streams through
// MAYA_Parse_Streams.cpp.
#include <cstddef>

#include "comp/Conversions.h"
#include "comp/HostPoint.h"
#include "comp/LayerStreams.h"
#include "maya/MAYA_Parse.h"
#include "plugin/ErrorCodes.h"

namespace {

void Translate(TransformMatrix* matrix, const HostPoint& by) {
  ThrowOnError(MatrixTranslate(matrix, by.x, by.y, by.z));
}

void TranslateBack(TransformMatrix* matrix, const HostPoint& by) {
  ThrowOnError(MatrixTranslate(matrix, -by.x, -by.y, -by.z));
}

}  // namespace

HostPoint MAYA_Parse::ConvertPoint(const double* point) const {
  return {ConvertDist(point[0]), -ConvertDist(point[1]), -ConvertDist(point[2])};
}

NodePivots MAYA_Parse::ConvertPivots(const MAYA_Transform& node) const {
  return {ConvertPoint(node.scalePivot), ConvertPoint(node.rotatePivot)};
}

void MAYA_Parse::CopyChannels(const MAYA_Transform& node, double (&values)[kChannelCount]) {
  for (int axis = 0; axis < kAxisCount; ++axis) {
    values[kAxisCount * kTranslateGroup + axis] = node.translate[axis];
    values[kAxisCount * kRotateGroup + axis] = node.rotate[axis];
    values[kAxisCount * kScaleGroup + axis] = node.scale[axis];
  }
}

MatrixComponents MAYA_Parse::DecomposeTransform(const NodePivots& pivots,
                                                const double (&values)[kChannelCount]) const {
  constexpr std::ptrdiff_t axes = kAxisCount;
  const double* const translate = values + axes * kTranslateGroup;
  const double* const rotate = values + axes * kRotateGroup;
  const double* const scale = values + axes * kScaleGroup;

  // Deliberate: always about X, then Y, then Z; the node's own rotate order is not looked at.
  TransformMatrix matrix{};
  ThrowOnError(MatrixSetIdentity(&matrix));
  TranslateBack(&matrix, pivots.scale);
  ThrowOnError(MatrixScale(&matrix, scale[0], scale[1], scale[2]));
  Translate(&matrix, pivots.scale);
  TranslateBack(&matrix, pivots.rotate);
  ThrowOnError(MatrixRotateAxis(&matrix, 1.0, 0.0, 0.0, ConvertRot(rotate[0]) * kDegreesToRadians));
  ThrowOnError(MatrixRotateAxis(&matrix, 0.0, 1.0, 0.0, ConvertRot(rotate[1]) * -kDegreesToRadians));
  ThrowOnError(MatrixRotateAxis(&matrix, 0.0, 0.0, 1.0, ConvertRot(rotate[2]) * -kDegreesToRadians));
  Translate(&matrix, pivots.rotate);
  Translate(&matrix, ConvertPoint(translate));

  MatrixComponents components{};
  ThrowOnError(MatrixDecompose(&matrix, &components, nullptr));
  return components;
}

void MAYA_Parse::SetTransform(VOR_Layer* layer, const MAYA_Transform* node) {
  double values[kChannelCount];
  CopyChannels(*node, values);
  const MatrixComponents at = DecomposeTransform(ConvertPivots(*node), values);
  SetThreeDStream(layer, kAnchorPointStream, 0.0, 0.0, 0.0);
  SetThreeDStream(layer, kScaleStream, at.scale[0] * kPercent, at.scale[1] * kPercent,
                  at.scale[2] * kPercent);
  SetOneDStream(layer, kRotationXStream, at.rotation[0] * kRadiansToDegrees);
  SetOneDStream(layer, kRotationYStream, at.rotation[1] * kRadiansToDegrees);
  SetOneDStream(layer, kRotationZStream, at.rotation[2] * kRadiansToDegrees);
  SetThreeDStream(layer, kPositionStream, at.translation[0], at.translation[1], at.translation[2]);
}
