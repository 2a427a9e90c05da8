// What the matrix services compute, without their fault points.
#pragma once

#include <cmath>

#include "hostutil/HostMatrix.h"

namespace hostutil::matrix {

constexpr int kAxes = 3;
constexpr int kSize = 4;

// A row of a matrix as two pairs of numbers, so that the compiler can take a pair at a time.
using Pair = double __attribute__((vector_size(2 * sizeof(double))));
struct Row {
  Pair left, right;
};

inline Row Load(const double (&row)[kSize]) { return {Pair{row[0], row[1]}, Pair{row[2], row[3]}}; }

inline void Store(const Row& from, double (&row)[kSize]) {
  row[0] = from.left[0];
  row[1] = from.left[1];
  row[2] = from.right[0];
  row[3] = from.right[1];
}

inline Row Sum(const Row& a, const Row& b) { return {a.left + b.left, a.right + b.right}; }

inline Row Product(double factor, const Row& row) { return {factor * row.left, factor * row.right}; }

struct Triple {
  double x, y, z;
};

inline void SetIdentity(TransformMatrix* matrix) {
  // Stored in pairs, as the next operations load them: a load across two stores stalls the processor.
  Store({Pair{1.0, 0.0}, Pair{0.0, 0.0}}, matrix->m[0]);
  Store({Pair{0.0, 1.0}, Pair{0.0, 0.0}}, matrix->m[1]);
  Store({Pair{0.0, 0.0}, Pair{1.0, 0.0}}, matrix->m[2]);
  Store({Pair{0.0, 0.0}, Pair{0.0, 1.0}}, matrix->m[3]);
}

inline void Translate(TransformMatrix* matrix, const Triple& by) {
  if (by.x == 0.0 && by.y == 0.0 && by.z == 0.0) return;  // so for nearly every pivot
  const Row last = Load(matrix->m[kAxes]);
  Store(Sum(Load(matrix->m[0]), Product(by.x, last)), matrix->m[0]);
  Store(Sum(Load(matrix->m[1]), Product(by.y, last)), matrix->m[1]);
  Store(Sum(Load(matrix->m[2]), Product(by.z, last)), matrix->m[2]);
}

inline void Scale(TransformMatrix* matrix, const Triple& by) {
  Store(Product(by.x, Load(matrix->m[0])), matrix->m[0]);
  Store(Product(by.y, Load(matrix->m[1])), matrix->m[1]);
  Store(Product(by.z, Load(matrix->m[2])), matrix->m[2]);
}

// Mixes the rows of the two other axes by the cosine and the sine. No product by 0 is added, so there is no
// further rounding. An angle of 0 leaves the matrix as it is.
inline void TurnAboutCoordinateAxis(TransformMatrix* matrix, int axis, double angle) {
  if (angle == 0.0) return;
  const double c = std::cos(angle);
  const double s = std::sin(angle);
  auto& first = matrix->m[(axis + 1) % kAxes];
  auto& second = matrix->m[(axis + 2) % kAxes];
  const Row j = Load(first);
  const Row k = Load(second);
  Store(Sum(Product(c, j), Product(-s, k)), first);
  Store(Sum(Product(s, j), Product(c, k)), second);
}

// HOST_ERR_MATRIX_NOT_FINITE, and all zeros handed out, when the matrix holds a value that is not finite.
HostError Decompose(const TransformMatrix& matrix, MatrixComponents* components);

}  // namespace hostutil::matrix
