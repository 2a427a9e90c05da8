// Plain arithmetic on matrices, to test the library's against.
#pragma once

#include <gtest/gtest.h>

#include <array>
#include <cmath>

#include "hostapi/ErrorCodes.h"
#include "hostutil/HostMatrix.h"

namespace hostutil_tests {

constexpr double kPi = 3.14159265358979323846;

using Point = std::array<double, 3>;

inline TransformMatrix Identity() {
  TransformMatrix matrix;
  EXPECT_EQ(MatrixSetIdentity(&matrix), HOST_ERR_NONE);
  return matrix;
}

// M·p, of a point.
inline Point Transformed(const TransformMatrix& matrix, const Point& p) {
  Point result{};
  for (std::size_t row = 0; row < 3; ++row) {
    result[row] = matrix.m[row][3];
    for (std::size_t column = 0; column < 3; ++column) result[row] += matrix.m[row][column] * p[column];
  }
  return result;
}

inline void ExpectNear(const Point& actual, const Point& expected, double tolerance) {
  for (std::size_t i = 0; i < 3; ++i) EXPECT_NEAR(actual[i], expected[i], tolerance) << "component " << i;
}

// T·Rz·Ry·Rx·S, one operation after the other.
inline TransformMatrix Composed(const MatrixComponents& c) {
  TransformMatrix matrix = Identity();
  EXPECT_EQ(MatrixScale(&matrix, c.scale[0], c.scale[1], c.scale[2]), HOST_ERR_NONE);
  EXPECT_EQ(MatrixRotateAxis(&matrix, 1, 0, 0, c.rotation[0]), HOST_ERR_NONE);
  EXPECT_EQ(MatrixRotateAxis(&matrix, 0, 1, 0, c.rotation[1]), HOST_ERR_NONE);
  EXPECT_EQ(MatrixRotateAxis(&matrix, 0, 0, 1, c.rotation[2]), HOST_ERR_NONE);
  EXPECT_EQ(MatrixTranslate(&matrix, c.translation[0], c.translation[1], c.translation[2]), HOST_ERR_NONE);
  return matrix;
}

inline MatrixComponents Decomposed(const TransformMatrix& matrix) {
  MatrixComponents components;
  EXPECT_EQ(MatrixDecompose(&matrix, &components, nullptr), HOST_ERR_NONE);
  return components;
}

// The largest difference of two entries.
inline double Distance(const TransformMatrix& a, const TransformMatrix& b) {
  double distance = 0;
  for (int row = 0; row < 4; ++row) {
    for (int column = 0; column < 4; ++column) {
      distance = std::fmax(distance, std::fabs(a.m[row][column] - b.m[row][column]));
    }
  }
  return distance;
}

}  // namespace hostutil_tests
