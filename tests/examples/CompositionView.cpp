#include "tests/examples/CompositionView.h"

#include <cstdint>

#include "hostapi/LayerStreams.h"

namespace conversion {
namespace {

constexpr std::int32_t kAnchor = HOST_STREAM_ANCHOR_POINT;
constexpr std::int32_t kPosition = HOST_STREAM_POSITION;
constexpr std::int32_t kScale = HOST_STREAM_SCALE;
constexpr std::int32_t kZRotation = HOST_STREAM_ROTATION_Z;
constexpr std::int32_t kXRotation = HOST_STREAM_ROTATION_X;
constexpr std::int32_t kYRotation = HOST_STREAM_ROTATION_Y;
constexpr std::int32_t kZoom = HOST_STREAM_ZOOM;

double valueAt(const refhost::Stream& stream, std::size_t component, std::size_t key) {
  if (!stream.keys) return stream.value[component];
  return stream.keys->values.at(key * static_cast<std::size_t>(stream.dimension) + component);
}

double number(const refhost::Layer& layer, std::int32_t id, std::size_t key) {
  return valueAt(*layer.findStream(id), 0, key);
}

Vector3 vector(const refhost::Layer& layer, std::int32_t id, std::size_t key) {
  const refhost::Stream& stream = *layer.findStream(id);
  return {valueAt(stream, 0, key), valueAt(stream, 1, key), valueAt(stream, 2, key)};
}

Matrix4 local(const refhost::Layer& layer, std::size_t key) {
  constexpr double percent = 0.01;
  const Vector3 scale = vector(layer, kScale, key);
  const Matrix4 turned = Matrix4::rotation(2, number(layer, kZRotation, key)) *
                         Matrix4::rotation(1, number(layer, kYRotation, key)) *
                         Matrix4::rotation(0, number(layer, kXRotation, key));
  const Matrix4 placed = Matrix4::translation(vector(layer, kPosition, key)) * turned *
                         Matrix4::scaling({scale.x * percent, scale.y * percent, scale.z * percent});
  if (layer.kind == refhost::LayerKind::Camera) return placed;
  const Vector3 anchor = vector(layer, kAnchor, key);
  return placed * Matrix4::translation({-anchor.x, -anchor.y, -anchor.z});
}

Matrix4 world(const refhost::Layer& layer, std::size_t key) {
  const Matrix4 own = local(layer, key);
  return layer.parent == nullptr ? own : world(*layer.parent, key) * own;
}

}  // namespace

CompositionView::CompositionView(const refhost::Composition& composition) : composition_(composition) {
  for (const refhost::Layer* layer : composition.layers) {
    if (layer->kind == refhost::LayerKind::Camera) camera_ = layer;
  }
}

const refhost::Layer* CompositionView::layer(const std::string& name) const {
  for (const refhost::Layer* layer : composition_.layers) {
    if (layer->name == name) return layer;
  }
  return nullptr;
}

Pixel CompositionView::seen(const refhost::Layer& layer, const Vector3& place, std::size_t key) const {
  const Vector3 inCamera = world(*camera_, key).inverse() * (world(layer, key) * place);
  const double zoom = number(*camera_, kZoom, key);
  return {zoom * inCamera.x / inCamera.z, zoom * inCamera.y / inCamera.z};
}

}  // namespace conversion
