// Keys: counted, sampled one by one, and written.
#include <array>

#include "hostapi/LayerStreams.h"
#include "tests/secondreader/AngleRounding.h"
#include "tests/secondreader/Builder.h"
#include "tests/secondreader/BuilderTemplates.h"

namespace secondreader {
namespace {

constexpr double kPi = 3.141592653589793;
constexpr double kTurn = 6.283185307179586;
constexpr double kDegreesPerRadian = 57.29577951308232;
constexpr double kPercent = 100.0;

double unwrapped(double angle, double previous) {
  while (angle - previous >= kPi) angle -= kTurn;
  while (angle - previous <= -kPi) angle += kTurn;
  return angle;
}

}  // namespace

// How many keys the node's channels share; 0 when it stands still.
int Builder::keyCount(const Transform& node) {
  std::size_t count = 0;
  for (std::size_t channel = 0; channel < kChannels; ++channel) {
    if (node.curve[channel] < 0) continue;
    const auto& keys = scene_.curves[static_cast<std::size_t>(node.curve[channel])].keys;
    if (keys == nullptr || keys->size() < 2) continue;
    if (count == 0) count = keys->size();
    if (keys->size() != count) {
      show_(kKeyCountsMessage);
      throw int{HOST_ERR_MAYA_KEY_COUNTS};
    }
  }
  return static_cast<int>(count);
}

T_Time Builder::keyTime(const Transform& node, std::size_t key) {
  for (std::size_t channel = 0; channel < kChannels; ++channel) {
    if (node.curve[channel] < 0) continue;
    const auto& keys = scene_.curves[static_cast<std::size_t>(node.curve[channel])].keys;
    if (keys != nullptr && keys->size() > key) return convert_.time((*keys)[key].time, key == 0);
  }
  return {0, 1};
}

void Builder::sample(const Transform& node, std::size_t group, std::size_t key, Triple& values) const {
  for (std::size_t axis = 0; axis < values.size(); ++axis) {
    const int index = node.curve[3 * group + axis];
    if (index < 0) continue;
    const auto& keys = scene_.curves[static_cast<std::size_t>(index)].keys;
    if (keys == nullptr || keys->empty()) continue;
    values[axis] = (*keys)[keys->size() == 1 ? 0 : key].value;
  }
}

void Builder::animate(Handle layer, const Transform& node) {
  const int count = keyCount(node);
  if (count < 1) return;
  const std::vector<Batch> animated = {{HOST_STREAM_SCALE},
                                       {HOST_STREAM_ROTATION_X},
                                       {HOST_STREAM_ROTATION_Y},
                                       {HOST_STREAM_ROTATION_Z},
                                       {HOST_STREAM_POSITION}};
  withBatches(layer, animated, [&](const std::vector<Batch>& batches) {
    Triple previous{};
    std::array<AngleRounding, 3> angleRoundings;
    for (std::size_t key = 0; key < static_cast<std::size_t>(count); ++key) {
      const T_Time time = keyTime(node, key);
      Triple scale = node.scale;
      Triple rotate = node.rotate;
      Triple translate = node.translate;
      sample(node, 2, key, scale);
      sample(node, 1, key, rotate);
      sample(node, 0, key, translate);
      const Parts parts = decomposed(node, translate, rotate, scale);
      const Rounding rounding = roundingAfter(rotate);
      insertKey(layer, batches[0], time,
                {parts.scale[0] * kPercent, parts.scale[1] * kPercent, parts.scale[2] * kPercent, rounding});
      for (std::size_t axis = 0; axis < previous.size(); ++axis) {
        const double angle = parts.rotation[axis];
        AngleRounding& known = angleRoundings[axis];
        const Rounding how = key > 0 ? known.next(angle, previous[axis]) : known.first(angle);
        previous[axis] = key > 0 ? unwrapped(angle, previous[axis]) : angle;
        insertKey(layer, batches[1 + axis], time, {previous[axis] * kDegreesPerRadian, 0.0, 0.0, how});
      }
      insertKey(layer, batches[4], time,
                {parts.translation[0], parts.translation[1], parts.translation[2], rounding});
    }
  });
}

void Builder::animateAnchor(Handle layer, const Transform& node) {
  const int count = keyCount(node);
  if (count < 1) return;
  withBatches(layer, {{HOST_STREAM_ANCHOR_POINT}}, [&](const std::vector<Batch>& batches) {
    for (std::size_t key = 0; key < static_cast<std::size_t>(count); ++key) {
      const T_Time time = keyTime(node, key);
      Triple point = node.translate;
      sample(node, 0, key, point);
      point = hostPoint(point);
      insertKey(layer, batches[0], time, {point[0], point[1], point[2]});
    }
  });
}

void Builder::zoomKeys(Handle stream, Batch& batch, const Camera& camera, const std::vector<Key>& keys) {
  check(suites_.beginKeyframeBatch(stream, &batch.number));
  for (std::size_t key = 0; key < keys.size(); ++key) {
    const T_Time time = convert_.time(keys[key].time, key == 0);
    std::int32_t index = 0;
    check(suites_.addBatchKeyframe(batch.number, time, &index));
    check(
        suites_.setBatchKeyframeValue(batch.number, index, stream, {convert_.zoom(camera, keys[key].value)}));
  }
  suites_.host().failBetweenCalls();
}

void Builder::animateCamera(Handle layer, const Camera& camera) {
  const int curve = camera.focalLengthCurve;
  const auto keys = curve < 0 ? nullptr : scene_.curves[static_cast<std::size_t>(curve)].keys;
  if (keys != nullptr && !keys->empty()) {
    Handle stream = 0;
    Batch batch{HOST_STREAM_ZOOM};
    bool held = false;
    HostError kept = suites_.host().guarded([&] {
      check(suites_.acquireLayerStream(layer, HOST_STREAM_ZOOM, &stream));
      std::int32_t count = 0;
      check(suites_.getStreamKeyframeCount(stream, &count));
      held = count > 0;
      if (held) suites_.host().excuse(stream);
      if (!held) zoomKeys(stream, batch, camera, *keys);
    });
    const HostError closing = suites_.host().guarded([&] { closeBatches({batch}); });
    if (kept == HOST_ERR_NONE) kept = closing;
    if (stream != 0 && !held) suites_.releaseStream(stream);
    check(kept);
  }
  const int transform = findNamed(scene_.transforms, camera.parent);
  if (transform >= 0) animate(layer, scene_.transforms[static_cast<std::size_t>(transform)]);
}

}  // namespace secondreader
