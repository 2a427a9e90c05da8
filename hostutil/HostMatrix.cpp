// Matrices: composing. Op·M changes only the rows of M that the operation mixes.
#include "hostutil/HostMatrix.h"

#include <algorithm>
#include <cmath>

#include "hostapi/ErrorCodes.h"
#include "hostutil/RehearsalInternal.h"

namespace {

constexpr int kAxes = 3;
constexpr int kSize = 4;

// The rotation about a unit axis. Written so that about a coordinate axis every entry is 0, 1, the cosine or
// the sine, without a rounding.
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
  *matrix = TransformMatrix{};
  for (int i = 0; i < kSize; ++i) matrix->m[i][i] = 1.0;
  return HOST_ERR_NONE;
}

HostError MatrixTranslate(TransformMatrix* matrix, double tx, double ty, double tz) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_MatrixTranslate, &code)) return code;
  if (matrix == nullptr) return HOST_ERR_UTILITY_NULL;
  const double offset[kAxes] = {tx, ty, tz};
  for (int row = 0; row < kAxes; ++row) {
    for (int column = 0; column < kSize; ++column) {
      matrix->m[row][column] += offset[row] * matrix->m[kAxes][column];
    }
  }
  return HOST_ERR_NONE;
}

HostError MatrixScale(TransformMatrix* matrix, double sx, double sy, double sz) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_MatrixScale, &code)) return code;
  if (matrix == nullptr) return HOST_ERR_UTILITY_NULL;
  const double factor[kAxes] = {sx, sy, sz};
  for (int row = 0; row < kAxes; ++row) {
    for (int column = 0; column < kSize; ++column) matrix->m[row][column] *= factor[row];
  }
  return HOST_ERR_NONE;
}

HostError MatrixRotateAxis(TransformMatrix* matrix, double ax, double ay, double az, double angle) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_MatrixRotateAxis, &code)) return code;
  if (matrix == nullptr) return HOST_ERR_UTILITY_NULL;
  if (ax == 0.0 && ay == 0.0 && az == 0.0) return HOST_ERR_NONE;
  double axis[kAxes] = {ax, ay, az};
  if (ax * ax + ay * ay + az * az != 1.0) Normalise(axis);
  double rotation[kAxes][kAxes];
  MakeRotation(axis, angle, rotation);
  for (int column = 0; column < kSize; ++column) {
    const double x = matrix->m[0][column];
    const double y = matrix->m[1][column];
    const double z = matrix->m[2][column];
    for (int row = 0; row < kAxes; ++row) {
      matrix->m[row][column] = rotation[row][0] * x + rotation[row][1] * y + rotation[row][2] * z;
    }
  }
  return HOST_ERR_NONE;
}
