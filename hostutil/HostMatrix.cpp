// Matrices: composing. Op·M changes only the rows of M that the operation mixes.
#include "hostutil/HostMatrix.h"

#include <algorithm>
#include <cmath>

#include "hostapi/ErrorCodes.h"
#include "hostutil/HostMatrixInternal.h"
#include "hostutil/RehearsalInternal.h"

using namespace hostutil::matrix;

namespace {

constexpr int kNoAxis = -1;

// The number of the coordinate axis that these are, or none.
int CoordinateAxis(double ax, double ay, double az) {
  if (ax == 1.0 && ay == 0.0 && az == 0.0) return 0;
  if (ax == 0.0 && ay == 1.0 && az == 0.0) return 1;
  return ax == 0.0 && ay == 0.0 && az == 1.0 ? 2 : kNoAxis;
}

// The rotation about a unit axis.
void MakeRotation(const double axis[kAxes], double angle, double rotation[kAxes][kAxes]) {
  const double c = std::cos(angle);
  const double s = std::sin(angle);
  for (int i = 0; i < kAxes; ++i) {
    const int j = (i + 1) % kAxes;
    const int k = (i + 2) % kAxes;
    rotation[i][i] = axis[i] * axis[i] + c * (axis[j] * axis[j] + axis[k] * axis[k]);
    const double mixed = (1.0 - c) * axis[i] * axis[j];
    rotation[i][j] = mixed - s * axis[k];
    rotation[j][i] = mixed + s * axis[k];
  }
}

// Divides by the largest component first, so that no length overflows or is lost.
void Normalise(double axis[kAxes]) {
  const double largest = std::max({std::abs(axis[0]), std::abs(axis[1]), std::abs(axis[2])});
  for (int i = 0; i < kAxes; ++i) axis[i] /= largest;
  const double length = std::sqrt(axis[0] * axis[0] + axis[1] * axis[1] + axis[2] * axis[2]);
  for (int i = 0; i < kAxes; ++i) axis[i] /= length;
}

}  // namespace

HostError MatrixSetIdentity(TransformMatrix* matrix) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_MatrixSetIdentity, &code)) {
    hostutil::HandOutNothing(matrix);
    return code;
  }
  if (matrix == nullptr) return HOST_ERR_UTILITY_NULL;
  SetIdentity(matrix);
  return HOST_ERR_NONE;
}

HostError MatrixTranslate(TransformMatrix* matrix, double tx, double ty, double tz) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_MatrixTranslate, &code)) return code;
  if (matrix == nullptr) return HOST_ERR_UTILITY_NULL;
  Translate(matrix, {tx, ty, tz});
  return HOST_ERR_NONE;
}

HostError MatrixScale(TransformMatrix* matrix, double sx, double sy, double sz) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_MatrixScale, &code)) return code;
  if (matrix == nullptr) return HOST_ERR_UTILITY_NULL;
  Scale(matrix, {sx, sy, sz});
  return HOST_ERR_NONE;
}

HostError MatrixRotateAxis(TransformMatrix* matrix, double ax, double ay, double az, double angle) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_MatrixRotateAxis, &code)) return code;
  if (matrix == nullptr) return HOST_ERR_UTILITY_NULL;
  if (ax == 0.0 && ay == 0.0 && az == 0.0) return HOST_ERR_NONE;
  if (const int axisNumber = CoordinateAxis(ax, ay, az); axisNumber != kNoAxis) {
    TurnAboutCoordinateAxis(matrix, axisNumber, angle);
    return HOST_ERR_NONE;
  }
  double axis[kAxes] = {ax, ay, az};
  if (ax * ax + ay * ay + az * az != 1.0) Normalise(axis);
  double rotation[kAxes][kAxes];
  MakeRotation(axis, angle, rotation);
  const Row x = Load(matrix->m[0]);
  const Row y = Load(matrix->m[1]);
  const Row z = Load(matrix->m[2]);
  for (int row = 0; row < kAxes; ++row) {
    const double* by = rotation[row];
    Store(Sum(Sum(Product(by[0], x), Product(by[1], y)), Product(by[2], z)), matrix->m[row]);
  }
  return HOST_ERR_NONE;
}
