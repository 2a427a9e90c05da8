#include "export/Places.h"

#include <cmath>
#include <numbers>

namespace interchange {
namespace {

Vector At(const Channel (&channels)[3], std::size_t frame) {
  return {channels[0].at(frame), channels[1].at(frame), channels[2].at(frame)};
}

// Between the axes of the scene and those of the host y and z point the other way.
Vector Turned(const Vector& a) { return {a.x, -a.y, -a.z}; }

// The camera that looks from the origin along the direction, without a roll: its x is level. Straight up and
// down x stays the scene's.
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

Matrix LocalRotationAt(const Composition& composition, const Layer& layer, std::size_t frame) {
  const Matrix rotation = RotationMatrix(At(layer.rotation, frame));
  if (!layer.aimed) return rotation;
  // Halves, so that two far places have a finite direction.
  const Vector direction = At(layer.interest, frame) * 0.5 - At(layer.position, frame) * 0.5;
  const double length = Length(direction);
  if (!(length > 0.0)) return rotation;
  // A length beyond what a double holds.
  if (!std::isfinite(length)) return Towards(composition, direction * 0.25) * rotation;
  return Towards(composition, direction) * rotation;
}

Place LocalPlaceAt(const Composition& composition, const Layer& layer, std::size_t frame) {
  return {At(layer.position, frame), QuaternionOf(LocalRotationAt(composition, layer, frame)),
          At(layer.scale, frame)};
}

Matrix LocalAt(const Composition& composition, const Layer& layer, std::size_t frame) {
  Matrix local = LocalRotationAt(composition, layer, frame) * Scaling(At(layer.scale, frame));
  local.SetColumn(3, At(layer.position, frame));
  return local;
}

Matrix WorldAt(const Composition& composition, std::size_t layer, std::size_t frame) {
  Matrix world = LocalAt(composition, composition.layers[layer], frame);
  std::size_t steps = 0;
  for (auto above = composition.layers[layer].parent; above && ++steps < composition.layers.size();
       above = composition.layers[*above].parent) {
    world = LocalAt(composition, composition.layers[*above], frame) * world;
  }
  return world;
}

Matrix ViewAt(const Composition& composition, std::size_t layer, std::size_t frame) {
  return RigidOf(WorldAt(composition, layer, frame));
}

double VerticalAngleAt(const Composition& composition, const Lens& lens, std::size_t frame) {
  return 2.0 * std::atan2(composition.height * 0.5, lens.zoom.at(frame)) * 180.0 / std::numbers::pi;
}

}  // namespace interchange
