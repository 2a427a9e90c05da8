// A transform in the host's space: scene points (x, y, z) become (x, -y, -z), angles about Y and Z change
// sign, and the pivots are folded into the position. Reads the units; sets streams through
// MAYA_Parse_Streams.cpp.
#include "comp/Conversions.h"
#include "comp/LayerStreams.h"
#include "maya/MAYA_Parse.h"
#include "plugin/ErrorCodes.h"

namespace {

struct HostPoint {
  double x, y, z;
};

void Translate(TransformMatrix* matrix, const HostPoint& by) {
  ThrowOnError(MatrixTranslate(matrix, by.x, by.y, by.z));
}

void TranslateBack(TransformMatrix* matrix, const HostPoint& by) {
  ThrowOnError(MatrixTranslate(matrix, -by.x, -by.y, -by.z));
}

}  // namespace

MatrixComponents MAYA_Parse::DecomposeTransform(const MAYA_Transform& node, const double (&scale)[kAxisCount],
                                                const double (&rotate)[kAxisCount],
                                                const double (&translate)[kAxisCount]) const {
  const auto hostPoint = [this](const double(&point)[kAxisCount]) {
    return HostPoint{ConvertDist(point[0]), -ConvertDist(point[1]), -ConvertDist(point[2])};
  };
  const HostPoint scalePivot = hostPoint(node.scalePivot);
  const HostPoint rotatePivot = hostPoint(node.rotatePivot);

  // Deliberate: always about X, then Y, then Z; the node's own rotate order is not looked at.
  TransformMatrix matrix{};
  ThrowOnError(MatrixSetIdentity(&matrix));
  TranslateBack(&matrix, scalePivot);
  ThrowOnError(MatrixScale(&matrix, scale[0], scale[1], scale[2]));
  Translate(&matrix, scalePivot);
  TranslateBack(&matrix, rotatePivot);
  ThrowOnError(MatrixRotateAxis(&matrix, 1.0, 0.0, 0.0, ConvertRot(rotate[0]) * kDegreesToRadians));
  ThrowOnError(MatrixRotateAxis(&matrix, 0.0, 1.0, 0.0, ConvertRot(rotate[1]) * -kDegreesToRadians));
  ThrowOnError(MatrixRotateAxis(&matrix, 0.0, 0.0, 1.0, ConvertRot(rotate[2]) * -kDegreesToRadians));
  Translate(&matrix, rotatePivot);
  Translate(&matrix, hostPoint(translate));

  MatrixComponents components{};
  ThrowOnError(MatrixDecompose(&matrix, &components, nullptr));
  return components;
}

void MAYA_Parse::SetTransform(VOR_Layer* layer, const MAYA_Transform* node) {
  const MatrixComponents at = DecomposeTransform(*node, node->scale, node->rotate, node->translate);
  SetThreeDStream(layer, kAnchorPointStream, 0.0, 0.0, 0.0);
  SetThreeDStream(layer, kScaleStream, at.scale[0] * kPercent, at.scale[1] * kPercent,
                  at.scale[2] * kPercent);
  SetOneDStream(layer, kRotationXStream, at.rotation[0] * kRadiansToDegrees);
  SetOneDStream(layer, kRotationYStream, at.rotation[1] * kRadiansToDegrees);
  SetOneDStream(layer, kRotationZStream, at.rotation[2] * kRadiansToDegrees);
  SetThreeDStream(layer, kPositionStream, at.translation[0], at.translation[1], at.translation[2]);
}
