// Where a transform stands below what is above it, computed for the tests alone. Column vectors, angles in
// degrees.
#pragma once

#include <algorithm>
#include <array>
#include <cmath>
#include <cstddef>
#include <numbers>

namespace check_test {

using Triple = std::array<double, 3>;

struct PlainPlace {
  std::array<Triple, 3> axes = {{{1, 0, 0}, {0, 1, 0}, {0, 0, 1}}};  // rows
  Triple origin{};

  friend PlainPlace operator*(const PlainPlace& a, const PlainPlace& b) {
    PlainPlace product;
    for (std::size_t row = 0; row < 3; ++row) {
      product.origin[row] = a.origin[row];
      for (std::size_t column = 0; column < 3; ++column) {
        product.axes[row][column] = 0.0;
        for (std::size_t k = 0; k < 3; ++k) product.axes[row][column] += a.axes[row][k] * b.axes[k][column];
        product.origin[row] += a.axes[row][column] * b.origin[column];
      }
    }
    return product;
  }
};

inline PlainPlace Moved(const Triple& by) { return {.origin = by}; }
inline PlainPlace MovedBack(const Triple& by) { return {.origin = {-by[0], -by[1], -by[2]}}; }

inline PlainPlace Scaled(const Triple& by) {
  PlainPlace place;
  for (std::size_t i = 0; i < 3; ++i) place.axes[i][i] = by[i];
  return place;
}

// About x (0), y (1) or z (2).
inline PlainPlace TurnedAbout(std::size_t axis, double degrees) {
  const double c = std::cos(degrees * std::numbers::pi / 180.0);
  const double s = std::sin(degrees * std::numbers::pi / 180.0);
  const std::size_t a = (axis + 1) % 3;
  const std::size_t b = (axis + 2) % 3;
  PlainPlace place;
  place.axes[a][a] = c;
  place.axes[a][b] = -s;
  place.axes[b][a] = s;
  place.axes[b][b] = c;
  return place;
}

// The axes in the order in which they turn.
inline PlainPlace TurnedInOrder(const Triple& degrees, const std::array<std::size_t, 3>& order) {
  return TurnedAbout(order[2], degrees[order[2]]) * TurnedAbout(order[1], degrees[order[1]]) *
         TurnedAbout(order[0], degrees[order[0]]);
}

// What a transform is made of.
struct PlainParts {
  Triple translate{}, rotate{}, scale{1, 1, 1}, rotatePivot{}, scalePivot{};
  Triple rotateAxis{}, shear{}, rotatePivotTranslate{}, scalePivotTranslate{};
  Triple offset{};        // in what stands above
  std::size_t order = 0;  // xyz, yzx, zxy, xzy, yxz, zyx
};

inline PlainPlace PlaceOf(const PlainParts& parts) {
  constexpr std::array<std::array<std::size_t, 3>, 6> kOrders = {
      {{0, 1, 2}, {1, 2, 0}, {2, 0, 1}, {0, 2, 1}, {1, 0, 2}, {2, 1, 0}}};
  PlainPlace shear;
  shear.axes[0][1] = parts.shear[0];
  shear.axes[0][2] = parts.shear[1];
  shear.axes[1][2] = parts.shear[2];
  return Moved(parts.offset) * Moved(parts.translate) * Moved(parts.rotatePivotTranslate) *
         Moved(parts.rotatePivot) * TurnedInOrder(parts.rotate, kOrders[parts.order % 6]) *
         TurnedInOrder(parts.rotateAxis, kOrders[0]) * MovedBack(parts.rotatePivot) *
         Moved(parts.scalePivotTranslate) * Moved(parts.scalePivot) * shear * Scaled(parts.scale) *
         MovedBack(parts.scalePivot);
}

// The farthest that the two are apart in one number, beside the size of what is compared.
inline double OriginsApart(const PlainPlace& a, const PlainPlace& b) {
  double apart = 0.0;
  double size = 1.0;
  for (std::size_t i = 0; i < 3; ++i) {
    apart = std::max(apart, std::fabs(a.origin[i] - b.origin[i]));
    size = std::max(size, std::fabs(a.origin[i]));
  }
  return apart / size;
}

inline double AxesApart(const PlainPlace& a, const PlainPlace& b) {
  double apart = 0.0;
  double size = 1.0;
  for (std::size_t i = 0; i < 9; ++i) {
    apart = std::max(apart, std::fabs(a.axes[i / 3][i % 3] - b.axes[i / 3][i % 3]));
    size = std::max(size, std::fabs(a.axes[i / 3][i % 3]));
  }
  return apart / size;
}

}  // namespace check_test
