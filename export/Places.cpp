#include "export/Places.h"

#include <cmath>
#include <numbers>
#include <optional>
#include <vector>

#include "export/LayerTree.h"

namespace interchange {
namespace {

// Converts between the axes of the scene and those of the host: y and z point the other way.
Vector Turned(const Vector& a) { return {a.x, -a.y, -a.z}; }

// The camera that looks from the origin along the direction, without a roll: its x is level. Where it looks
// straight up or down, its x is that of the scene.
Matrix TowardsInScene(const Vector& direction) {
  const Vector z = Normalised(direction) * -1.0;
  Vector x = Normalised(Cross({0.0, 1.0, 0.0}, z));
  if (x == Vector{}) x = {1.0, 0.0, 0.0};
  Matrix axes;
  axes.SetColumn(0, x);
  axes.SetColumn(1, Cross(z, x));
  axes.SetColumn(2, z);
  return axes;
}

Matrix Towards(const Composition& composition, const Vector& direction) {
  if (composition.axes == Axes::Scene) return TowardsInScene(direction);
  const Matrix turned = Scaling({1.0, -1.0, -1.0});
  return turned * TowardsInScene(Turned(direction)) * turned;
}

}  // namespace

Vector VectorAt(const Channel (&channels)[3], std::size_t frame) {
  return {channels[0].at(frame), channels[1].at(frame), channels[2].at(frame)};
}

Matrix LocalRotationAt(const Composition& composition, const Layer& layer, std::size_t frame) {
  const Matrix rotation = RotationMatrix(VectorAt(layer.rotation, frame));
  if (!layer.aimed) return rotation;
  // Halves, so that the direction between two far places is finite.
  const Vector direction = VectorAt(layer.interest, frame) * 0.5 - VectorAt(layer.position, frame) * 0.5;
  const double length = Length(direction);
  if (!(length > 0.0)) return rotation;
  // The length is larger than a double can be.
  if (!std::isfinite(length)) return Towards(composition, direction * 0.25) * rotation;
  return Towards(composition, direction) * rotation;
}

Place LocalPlaceAt(const Composition& composition, const Layer& layer, std::size_t frame) {
  return {VectorAt(layer.position, frame), QuaternionOf(LocalRotationAt(composition, layer, frame)),
          VectorAt(layer.scale, frame)};
}

Matrix LocalAt(const Composition& composition, const Layer& layer, std::size_t frame) {
  Matrix local = LocalRotationAt(composition, layer, frame) * Scaling(VectorAt(layer.scale, frame));
  local.SetColumn(3, VectorAt(layer.position, frame));
  return local;
}

Worlds::Worlds(const Composition& composition, bool camerasAlone)
    : composition_(composition),
      order_(LayerTree(composition).ParentsFirst()),
      matrices_(composition.layers.size()) {
  if (!camerasAlone) return;
  std::vector<bool> wanted(matrices_.size());
  // Children come before their parents here.
  for (auto layer = order_.rbegin(); layer != order_.rend(); ++layer) {
    const Layer& one = composition.layers[*layer];
    if (one.kind == LayerKind::Camera) wanted[*layer] = true;
    if (wanted[*layer] && one.parent) wanted[*one.parent] = true;
  }
  std::erase_if(order_, [&](std::size_t layer) { return !wanted[layer]; });
}

void Worlds::GoTo(std::size_t frame) {
  for (const std::size_t layer : order_) {
    const std::optional<std::size_t>& parent = composition_.layers[layer].parent;
    const Matrix local = LocalAt(composition_, composition_.layers[layer], frame);
    matrices_[layer] = parent ? matrices_[*parent] * local : local;
  }
}

double VerticalRadians(const Composition& composition, double zoom) {
  return 2.0 * std::atan2(composition.height * 0.5, zoom);
}

double VerticalAngleAt(const Composition& composition, const Lens& lens, std::size_t frame) {
  return VerticalRadians(composition, lens.zoom.at(frame)) * 180.0 / std::numbers::pi;
}

}  // namespace interchange
