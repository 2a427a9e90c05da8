// 4x4 matrices that act on column vectors, for working a projection out by hand.
#pragma once

#include <array>
#include <cmath>
#include <cstddef>
#include <numbers>

namespace conversion {

struct Vector3 {
  double x = 0.0;
  double y = 0.0;
  double z = 0.0;
};

// An affine map: the last row is (0, 0, 0, 1) and not stored.
class Matrix4 {
 public:
  static Matrix4 translation(const Vector3& by) {
    Matrix4 result;
    result.m_[0][3] = by.x;
    result.m_[1][3] = by.y;
    result.m_[2][3] = by.z;
    return result;
  }

  static Matrix4 scaling(const Vector3& by) {
    Matrix4 result;
    result.m_[0][0] = by.x;
    result.m_[1][1] = by.y;
    result.m_[2][2] = by.z;
    return result;
  }

  // About a coordinate axis (0 x, 1 y, 2 z), counter-clockwise as seen from its tip.
  static Matrix4 rotation(std::size_t axis, double degrees) {
    const double angle = degrees * std::numbers::pi / 180.0;
    const std::size_t first = (axis + 1) % 3;
    const std::size_t second = (axis + 2) % 3;
    Matrix4 result;
    result.m_[first][first] = std::cos(angle);
    result.m_[first][second] = -std::sin(angle);
    result.m_[second][first] = std::sin(angle);
    result.m_[second][second] = std::cos(angle);
    return result;
  }

  Matrix4 operator*(const Matrix4& right) const {
    Matrix4 result;
    for (std::size_t row = 0; row < 3; ++row) {
      for (std::size_t column = 0; column < 4; ++column) {
        double sum = column == 3 ? m_[row][3] : 0.0;
        for (std::size_t k = 0; k < 3; ++k) sum += m_[row][k] * right.m_[k][column];
        result.m_[row][column] = sum;
      }
    }
    return result;
  }

  Vector3 operator*(const Vector3& point) const {
    const auto part = [&](std::size_t row) {
      return m_[row][0] * point.x + m_[row][1] * point.y + m_[row][2] * point.z + m_[row][3];
    };
    return {part(0), part(1), part(2)};
  }

  // The linear part is not singular.
  Matrix4 inverse() const {
    const auto cofactor = [&](std::size_t row, std::size_t column) {
      const std::size_t r1 = (row + 1) % 3, r2 = (row + 2) % 3, c1 = (column + 1) % 3, c2 = (column + 2) % 3;
      return m_[r1][c1] * m_[r2][c2] - m_[r1][c2] * m_[r2][c1];
    };
    const double determinant =
        m_[0][0] * cofactor(0, 0) + m_[0][1] * cofactor(0, 1) + m_[0][2] * cofactor(0, 2);
    Matrix4 result;
    for (std::size_t row = 0; row < 3; ++row) {
      for (std::size_t column = 0; column < 3; ++column) {
        result.m_[row][column] = cofactor(column, row) / determinant;
      }
    }
    const Vector3 moved = result * Vector3{m_[0][3], m_[1][3], m_[2][3]};
    return translation({-moved.x, -moved.y, -moved.z}) * result;
  }

 private:
  std::array<std::array<double, 4>, 3> m_ = {
      {{1.0, 0.0, 0.0, 0.0}, {0.0, 1.0, 0.0, 0.0}, {0.0, 0.0, 1.0, 0.0}}};
};

}  // namespace conversion
