#include "tests/export/Space.h"

#include <algorithm>
#include <cmath>
#include <numbers>

namespace exporttest {
namespace {

using interchange::Channel;
using interchange::Composition;
using interchange::Layer;

Point Minus(const Point& a, const Point& b) { return {a[0] - b[0], a[1] - b[1], a[2] - b[2]}; }
double Dot(const Point& a, const Point& b) { return a[0] * b[0] + a[1] * b[1] + a[2] * b[2]; }
Point Cross(const Point& a, const Point& b) {
  return {a[1] * b[2] - a[2] * b[1], a[2] * b[0] - a[0] * b[2], a[0] * b[1] - a[1] * b[0]};
}
Point Column(const Rows& rows, std::size_t at) { return {rows[0][at], rows[1][at], rows[2][at]}; }

Rows About(std::size_t axis, double degrees) {
  const double angle = degrees * std::numbers::pi / 180.0;
  const std::size_t a = (axis + 1) % 3, b = (axis + 2) % 3;
  Rows rows = Seat().axes;
  rows[a][a] = rows[b][b] = std::cos(angle);
  rows[b][a] = std::sin(angle);
  rows[a][b] = -std::sin(angle);
  return rows;
}

Point Values(const Channel (&channels)[3], std::size_t frame) {
  return {channels[0].at(frame), channels[1].at(frame), channels[2].at(frame)};
}

// With two angles: the camera turns about the vertical, then tilts. In the host's axes both y and z point the
// other way.
Rows LooksTowards(Point direction, bool hostAxes) {
  if (hostAxes) direction = {direction[0], -direction[1], -direction[2]};
  const double pan = std::atan2(-direction[0], -direction[2]) * 180.0 / std::numbers::pi;
  const double tilt =
      std::atan2(direction[1], std::hypot(direction[0], direction[2])) * 180.0 / std::numbers::pi;
  const bool upright = direction[0] == 0.0 && direction[2] == 0.0;
  const Rows scene = Product(About(1, upright ? 0.0 : pan), About(0, tilt));
  if (!hostAxes) return scene;
  const Rows flip = {{{1, 0, 0}, {0, -1, 0}, {0, 0, -1}}};
  return Product(flip, Product(scene, flip));
}

Seat LocalSeat(const Composition& composition, const Layer& layer, std::size_t frame) {
  Seat seat;
  seat.place = Values(layer.position, frame);
  Rows turned = TurnedXyz(Values(layer.rotation, frame));
  const Point direction = Minus(Values(layer.interest, frame), seat.place);
  if (layer.aimed && Dot(direction, direction) > 0.0) {
    turned = Product(LooksTowards(direction, composition.axes == interchange::Axes::Host), turned);
  }
  seat.axes = Scaled(turned, Values(layer.scale, frame));
  return seat;
}

}  // namespace

Rows Product(const Rows& a, const Rows& b) {
  Rows product{};
  for (std::size_t i = 0; i < 3; ++i) {
    for (std::size_t j = 0; j < 3; ++j) {
      for (std::size_t k = 0; k < 3; ++k) product[i][j] += a[i][k] * b[k][j];
    }
  }
  return product;
}

Point Applied(const Rows& rows, const Point& point) {
  return {Dot(rows[0], point), Dot(rows[1], point), Dot(rows[2], point)};
}

Point Applied(const Seat& seat, const Point& point) {
  const Point turned = Applied(seat.axes, point);
  return {turned[0] + seat.place[0], turned[1] + seat.place[1], turned[2] + seat.place[2]};
}

Seat Below(const Seat& parent, const Seat& child) {
  return {Product(parent.axes, child.axes), Applied(parent, child.place)};
}

Rows TurnedXyz(const Point& degrees) {
  return Product(About(2, degrees[2]), Product(About(1, degrees[1]), About(0, degrees[0])));
}

Rows TurnedBy(const std::array<double, 4>& q) {
  const double square = q[0] * q[0] + q[1] * q[1] + q[2] * q[2] + q[3] * q[3];
  const double s = 2.0 / square;
  return {{{1 - s * (q[1] * q[1] + q[2] * q[2]), s * (q[0] * q[1] - q[2] * q[3]),
            s * (q[0] * q[2] + q[1] * q[3])},
           {s * (q[0] * q[1] + q[2] * q[3]), 1 - s * (q[0] * q[0] + q[2] * q[2]),
            s * (q[1] * q[2] - q[0] * q[3])},
           {s * (q[0] * q[2] - q[1] * q[3]), s * (q[1] * q[2] + q[0] * q[3]),
            1 - s * (q[0] * q[0] + q[1] * q[1])}}};
}

Rows Scaled(const Rows& rows, const Point& scale) {
  Rows scaled = rows;
  for (auto& row : scaled) {
    for (std::size_t j = 0; j < 3; ++j) row[j] *= scale[j];
  }
  return scaled;
}

Seat WorldSeat(const Composition& composition, std::size_t layer, std::size_t frame) {
  Seat seat = LocalSeat(composition, composition.layers[layer], frame);
  for (auto above = composition.layers[layer].parent; above; above = composition.layers[*above].parent) {
    seat = Below(LocalSeat(composition, composition.layers[*above], frame), seat);
  }
  return seat;
}

std::optional<std::array<double, 2>> PixelOf(const Seat& camera, double zoom, const Point& point) {
  const Point away = Minus(point, camera.place);
  const Point x = Column(camera.axes, 0), y = Column(camera.axes, 1), z = Column(camera.axes, 2);
  const double volume = Dot(x, Cross(y, z));
  const double right = Dot(away, Cross(y, z)) / volume;
  const double up = Dot(x, Cross(away, z)) / volume;
  const double ahead = -Dot(x, Cross(y, away)) / volume;
  if (!(ahead > 1e-9)) return std::nullopt;
  return {{right / ahead * zoom, up / ahead * zoom}};
}

double Distance(const Point& a, const Point& b) {
  const Point away = Minus(a, b);
  return std::hypot(away[0], away[1], away[2]);
}

double LargestPart(const Point& a) { return std::max({std::fabs(a[0]), std::fabs(a[1]), std::fabs(a[2])}); }

}  // namespace exporttest
