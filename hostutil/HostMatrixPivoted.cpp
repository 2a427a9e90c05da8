// A transform with pivots, taken apart: eleven matrix services in one call.
#include "hostapi/ErrorCodes.h"
#include "hostutil/HostMatrixInternal.h"
#include "hostutil/RehearsalInternal.h"

using namespace hostutil::matrix;

namespace {

constexpr int kTranslations = 5;
constexpr int kRotations = 3;

Triple At(const double (&point)[kAxes]) { return {point[0], point[1], point[2]}; }
Triple Back(const double (&point)[kAxes]) { return {-point[0], -point[1], -point[2]}; }

HostError MoveBy(TransformMatrix* matrix, const Triple& by) {
  return MatrixTranslate(matrix, by.x, by.y, by.z);
}

HostError TurnAbout(TransformMatrix* matrix, int axis, double angle) {
  return MatrixRotateAxis(matrix, axis == 0 ? 1.0 : 0.0, axis == 1 ? 1.0 : 0.0, axis == 2 ? 1.0 : 0.0, angle);
}

// Call by call, up to the first that fails.
HostError DecomposeByServices(const PivotedTransform& from, MatrixComponents* components) {
  TransformMatrix matrix{};
  HostError code = MatrixSetIdentity(&matrix);
  if (code == HOST_ERR_NONE) code = MoveBy(&matrix, Back(from.scalePivot));
  if (code == HOST_ERR_NONE) code = MatrixScale(&matrix, from.scale[0], from.scale[1], from.scale[2]);
  if (code == HOST_ERR_NONE) code = MoveBy(&matrix, At(from.scalePivot));
  if (code == HOST_ERR_NONE) code = MoveBy(&matrix, Back(from.rotatePivot));
  for (int axis = 0; axis < kAxes && code == HOST_ERR_NONE; ++axis) {
    code = TurnAbout(&matrix, axis, from.rotation[axis]);
  }
  if (code == HOST_ERR_NONE) code = MoveBy(&matrix, At(from.rotatePivot));
  if (code == HOST_ERR_NONE) code = MoveBy(&matrix, At(from.translation));
  return code == HOST_ERR_NONE ? MatrixDecompose(&matrix, components, nullptr) : code;
}

void CountServices() {
  hostutil::CountCalls(HOST_UTILITY_MatrixSetIdentity, 1);
  hostutil::CountCalls(HOST_UTILITY_MatrixTranslate, kTranslations);
  hostutil::CountCalls(HOST_UTILITY_MatrixScale, 1);
  hostutil::CountCalls(HOST_UTILITY_MatrixRotateAxis, kRotations);
  hostutil::CountCalls(HOST_UTILITY_MatrixDecompose, 1);
}

}  // namespace

HostError MatrixDecomposePivoted(const PivotedTransform* from, MatrixComponents* components) {
  if (from == nullptr || components == nullptr) {
    hostutil::HandOutNothing(components);
    return HOST_ERR_UTILITY_NULL;
  }
  if (!hostutil::MayWorkInBulk()) return DecomposeByServices(*from, components);
  CountServices();
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
