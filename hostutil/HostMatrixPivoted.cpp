// A transform with pivots, composed and taken apart.
#include "hostapi/ErrorCodes.h"
#include "hostutil/HostMatrixInternal.h"
#include "hostutil/RehearsalInternal.h"

using namespace hostutil::matrix;

namespace {

Triple At(const double (&point)[kAxes]) { return {point[0], point[1], point[2]}; }
Triple Back(const double (&point)[kAxes]) { return {-point[0], -point[1], -point[2]}; }

}  // namespace

HostError MatrixDecomposePivoted(const PivotedTransform* from, MatrixComponents* components) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_MatrixDecompose, &code)) {
    hostutil::HandOutNothing(components);
    return code;
  }
  if (components == nullptr) return HOST_ERR_UTILITY_NULL;
  if (from == nullptr) {
    *components = MatrixComponents{};
    return HOST_ERR_UTILITY_NULL;
  }
  TransformMatrix matrix;
  SetIdentity(&matrix);
  Translate(&matrix, Back(from->scalePivot));
  Scale(&matrix, At(from->scale));
  Translate(&matrix, At(from->scalePivot));
  Translate(&matrix, Back(from->rotatePivot));
  for (int axis = 0; axis < kAxes; ++axis) TurnAboutCoordinateAxis(&matrix, axis, from->rotation[axis]);
  Translate(&matrix, At(from->rotatePivot));
  Translate(&matrix, At(from->translation));
  return Decompose(matrix, components);
}
