#include "check/ImportedPicture.h"

#include <algorithm>
#include <cmath>
#include <numbers>

#include "motion/Rotation.h"

namespace check {
namespace {

using motion::Matrix;
using motion::Vector;

constexpr double kRadians = std::numbers::pi / 180.0;

Vector VectorAt(const CameOverStream& stream, double seconds) {
  return {ValueAt(stream, seconds, 0, 3), ValueAt(stream, seconds, 1, 3), ValueAt(stream, seconds, 2, 3)};
}

// Y and Z of a composition point the other way.
Vector Turned(const Vector& point) { return {point.x, -point.y, -point.z}; }

Matrix Rotation(const CameOverLayer& layer, double seconds) {
  const Vector angles{ValueAt(layer.rotateX, seconds, 0, 1) * kRadians,
                      -ValueAt(layer.rotateY, seconds, 0, 1) * kRadians,
                      -ValueAt(layer.rotateZ, seconds, 0, 1) * kRadians};
  return motion::RotationMatrix(angles, motion::RotateOrder::kXYZ);
}

// A camera at the origin that looks along -Z, turned towards the direction, without a roll.
Matrix Towards(const Vector& direction) {
  Matrix frame;
  frame.z = -direction;
  frame.x = Cross({0.0, 1.0, 0.0}, frame.z);
  frame.y = Cross(frame.z, frame.x);
  return motion::RotationOf(frame);
}

Matrix LocalOf(const CameOverLayer& layer, double seconds, double unit) {
  const Vector place = Turned(VectorAt(layer.position, seconds)) * (1.0 / unit);
  Matrix rotation = Rotation(layer, seconds);
  if (layer.aimed) {
    const Vector interest = Turned(VectorAt(layer.interest, seconds)) * (1.0 / unit);
    if (Length(interest - place) > 0.0) rotation = rotation * Towards(interest - place);
  }
  const Matrix scale = motion::Scaling(VectorAt(layer.scale, seconds) * 0.01);
  return scale * rotation * motion::Translation(place);
}

}  // namespace

double ValueAt(const CameOverStream& stream, double seconds, std::size_t component, std::size_t components) {
  if (stream.times.empty()) return stream.value[component];
  const auto value = [&](std::size_t key) { return stream.values[key * components + component]; };
  const auto after = static_cast<std::size_t>(
      std::upper_bound(stream.times.begin(), stream.times.end(), seconds) - stream.times.begin());
  if (after == 0) return value(0);
  if (after == stream.times.size()) return value(after - 1);
  const double from = stream.times[after - 1];
  const double part = (seconds - from) / (stream.times[after] - from);
  return value(after - 1) + part * (value(after) - value(after - 1));
}

ImportedPicture::ImportedPicture(const CameOver& cameOver, const CameOverLayer& camera, double unit)
    : cameOver_(cameOver), unit_(unit) {
  chain_.push_back(&camera);
  for (auto above = camera.parent; above && chain_.size() <= cameOver.layers.size();) {
    chain_.push_back(&cameOver.layers[*above]);
    above = cameOver.layers[*above].parent;
  }
}

bool ImportedPicture::Moves() const {
  return std::any_of(chain_.begin(), chain_.end(), [](const CameOverLayer* layer) {
    const auto streams = {&layer->position, &layer->scale,    &layer->rotateX, &layer->rotateY,
                          &layer->rotateZ,  &layer->interest, &layer->zoom};
    return std::any_of(streams.begin(), streams.end(),
                       [](const CameOverStream* stream) { return stream->times.size() > 1; });
  });
}

void ImportedPicture::MoveTo(double seconds) {
  Matrix world;
  for (const CameOverLayer* const layer : chain_) world = world * LocalOf(*layer, seconds, unit_);
  Matrix camera = motion::RotationOf(world);
  camera.origin = world.origin;
  if (!motion::Invert(camera, &toCamera_)) toCamera_ = motion::Matrix{{}, {}, {}, {}};
  zoom_ = ValueAt(chain_.front()->zoom, seconds, 0, 1);
}

bool ImportedPicture::Project(const Vector& point, motion::PicturePoint* landed) const {
  const Vector seen = motion::TransformPoint(point, toCamera_);
  if (!(seen.z < 0.0)) return false;
  const CameOverComposition& composition = *cameOver_.composition;
  const motion::PicturePoint place{0.5 + seen.x * zoom_ / -seen.z / composition.layerWidth,
                                   0.5 + seen.y * zoom_ / -seen.z / composition.height};
  if (!std::isfinite(place.u) || !std::isfinite(place.v)) return false;
  *landed = place;
  return true;
}

}  // namespace check
