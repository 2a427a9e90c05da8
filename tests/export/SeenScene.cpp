#include "tests/export/SeenScene.h"

#include <algorithm>
#include <cmath>

namespace exporttest {
namespace {

Point Three(const std::array<double, 4>& values) { return {values[0], values[1], values[2]}; }

std::array<double, 4> Straight(const std::array<double, 4>& a, const std::array<double, 4>& b, double part) {
  std::array<double, 4> between{};
  for (std::size_t i = 0; i < 4; ++i) between[i] = a[i] * (1 - part) + b[i] * part;
  return between;
}

// Along the shorter arc, as the formats ask for.
std::array<double, 4> Arc(const std::array<double, 4>& a, std::array<double, 4> b, double part) {
  double cosine = 0.0;
  for (std::size_t i = 0; i < 4; ++i) cosine += a[i] * b[i];
  if (cosine < 0.0) {
    for (double& value : b) value = -value;
    cosine = -cosine;
  }
  if (cosine > 0.9999999) return Straight(a, b, part);
  const double angle = std::acos(cosine);
  std::array<double, 4> between{};
  for (std::size_t i = 0; i < 4; ++i) {
    between[i] = (a[i] * std::sin((1 - part) * angle) + b[i] * std::sin(part * angle)) / std::sin(angle);
  }
  return between;
}

}  // namespace

std::array<double, 4> Track::At(double time, bool quaternions) const {
  if (times.empty() || time <= times.front()) return values.front();
  if (time >= times.back()) return values.back();
  const auto after =
      static_cast<std::size_t>(std::upper_bound(times.begin(), times.end(), time) - times.begin());
  const double part = (time - times[after - 1]) / (times[after] - times[after - 1]);
  return quaternions ? Arc(values[after - 1], values[after], part)
                     : Straight(values[after - 1], values[after], part);
}

Seat SeenScene::WorldOf(std::size_t layer, double time) const {
  Seat world;
  for (std::optional<std::size_t> at = layer; at; at = layers[*at].parent) {
    const SeenLayer& seen = layers[*at];
    const std::array<double, 4> turn = seen.rotation.At(time, seen.quaternions);
    const Rows turned = seen.quaternions ? TurnedBy(turn) : TurnedXyz(Three(turn));
    world = Below({Scaled(turned, Three(seen.scale.At(time))), Three(seen.position.At(time))}, world);
  }
  return world;
}

double SeenScene::ZoomOf(std::size_t layer, double time, double height) const {
  return height / 2 / layers[layer].lens.At(time)[0];
}

}  // namespace exporttest
