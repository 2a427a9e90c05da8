// 4×4 matrices that act on columns, in a right-handed world, worked out slowly.
#pragma once

#include <array>
#include <optional>

#include "tests/secondreader/Records.h"

namespace secondreader {

using Matrix = std::array<std::array<double, 4>, 4>;  // rows

Matrix identity();
Matrix translation(const Triple& by);
Matrix scaling(const Triple& by);

// The rotation about X (0), Y (1) or Z (2), in radians; seen against the axis it turns to the left.
Matrix rotation(std::size_t axis, double angle);

// What both together do, the second after the first.
Matrix after(const Matrix& second, const Matrix& first);

struct Parts {
  Triple translation{};
  Triple scale{};
  Triple rotation{};  // radians, to be turned about X first, then Y, then Z
};

// Takes a matrix apart that turns what was scaled along the axes. A mirrored one has a negative X scale. Y
// lies within a quarter turn; where it is a quarter turn, Z is 0. An axis of length 0 has scale 0, and what
// it leaves open of the angles is 0. Nothing for a matrix that is not finite.
std::optional<Parts> takeApart(const Matrix& matrix);

}  // namespace secondreader
