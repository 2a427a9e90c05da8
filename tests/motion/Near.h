// Points and matrices that agree but for rounding.
#pragma once

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <ostream>

#include "motion/Matrix.h"

namespace motion {

inline void PrintTo(const Vector& vector, std::ostream* out) {
  *out << vector.x << ' ' << vector.y << ' ' << vector.z;
}

inline void PrintTo(const Matrix& matrix, std::ostream* out) {
  for (const Vector& row : {matrix.x, matrix.y, matrix.z, matrix.origin}) {
    PrintTo(row, out);
    *out << "; ";
  }
}

}  // namespace motion

namespace testmotion {

MATCHER_P2(VectorNear, expected, tolerance, testing::PrintToString(expected)) {
  return motion::Length(arg - expected) <= tolerance;
}

MATCHER_P2(MatrixNear, expected, tolerance, testing::PrintToString(expected)) {
  return motion::Length(arg.x - expected.x) <= tolerance && motion::Length(arg.y - expected.y) <= tolerance &&
         motion::Length(arg.z - expected.z) <= tolerance &&
         motion::Length(arg.origin - expected.origin) <= tolerance;
}

}  // namespace testmotion
