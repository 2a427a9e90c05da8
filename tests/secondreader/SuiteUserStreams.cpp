// Streams and keyframe batches, as far as the played host looks at them.
#include <algorithm>
#include <cmath>
#include <vector>

#include "hostapi/LayerStreams.h"
#include "tests/secondreader/SuiteUser.h"

namespace secondreader {
namespace {

constexpr std::int32_t kThreeDimensional[] = {HOST_STREAM_ANCHOR_POINT, HOST_STREAM_POSITION,
                                              HOST_STREAM_SCALE};
constexpr std::int32_t kOneDimensional[] = {HOST_STREAM_ROTATION_Z, HOST_STREAM_ROTATION_X,
                                            HOST_STREAM_ROTATION_Y};

bool isOneOf(const std::int32_t (&ids)[3], std::int32_t id) {
  return std::find(std::begin(ids), std::end(ids), id) != std::end(ids);
}

bool hasStream(const PlayedLayer& layer, std::int32_t id) {
  return isOneOf(kThreeDimensional, id) || isOneOf(kOneDimensional, id) ||
         (id == HOST_STREAM_ZOOM && layer.camera);
}

template <typename Object>
Object* find(std::vector<Object>& objects, Handle number) {
  const auto found = std::find_if(objects.begin(), objects.end(),
                                  [&](const Object& object) { return object.number == number; });
  return found == objects.end() ? nullptr : &*found;
}

bool areFinite(const SuiteUser::Value& value, std::int32_t id) {
  const std::ptrdiff_t used = isOneOf(kThreeDimensional, id) ? 3 : 1;
  return std::all_of(value.numbers.begin(), value.numbers.begin() + used,
                     [](double number) { return std::isfinite(number); });
}

}  // namespace

HostError SuiteUser::acquireLayerStream(Handle layer, std::int32_t id, Handle* stream) {
  PlayedCall call(host_, "AcquireLayerStream", use(kStream7));
  if (call.goesOn() && call.demand(layer != 0, HOST_ERR_BAD_HANDLE) &&
      call.demand(hasStream(host_.layers[static_cast<std::size_t>(layer) - 1], id),
                  HOST_ERR_NO_SUCH_STREAM)) {
    *stream = ++host_.streams;
    host_.heldStreams.push_back({*stream, layer, id});
  }
  call.line().integer("pluginId", host_.options.pluginId).handle("layer", "layer", layer);
  call.line().integer("streamId", id);
  call.handed("stream", "stream", *stream);
  return call.finish();
}

HostError SuiteUser::releaseStream(Handle stream) {
  PlayedCall call(host_, "ReleaseStream", use(kStream7));
  if (call.goesOn()) {
    const auto gone =
        std::erase_if(host_.heldStreams, [&](const auto& held) { return held.number == stream; });
    call.demand(gone != 0, HOST_ERR_BAD_HANDLE);
  } else {
    host_.excuse(stream);
  }
  call.line().handle("stream", "stream", stream);
  return call.finish();
}

HostError SuiteUser::setStreamValue(Handle stream, const Value& value) {
  PlayedCall call(host_, "SetStreamValue", use(kStream8));
  if (call.goesOn()) {
    const HeldStream* held = find(host_.heldStreams, stream);
    if (call.demand(held != nullptr, HOST_ERR_BAD_HANDLE) && !host_.options.permissive) {
      call.demand(areFinite(value, held->stream), HOST_ERR_BAD_VALUE);
    }
  }
  call.line().integer("pluginId", host_.options.pluginId).handle("stream", "stream", stream);
  call.line().numbers("value", value.numbers);
  call.rounded(value.rounding);
  return call.finish();
}

HostError SuiteUser::getStreamKeyframeCount(Handle stream, std::int32_t* count) {
  PlayedCall call(host_, "GetStreamKeyframeCount", use(kKeyframe3));
  *count = 0;
  if (call.goesOn() && call.demand(find(host_.heldStreams, stream) != nullptr, HOST_ERR_BAD_HANDLE)) {
    *count = host_.options.zoomKeys;
  }
  call.line().handle("stream", "stream", stream);
  call.handedInteger("count", *count);
  return call.finish();
}

HostError SuiteUser::beginKeyframeBatch(Handle stream, Handle* batch) {
  PlayedCall call(host_, "BeginKeyframeBatch", use(kKeyframe3));
  if (call.goesOn()) {
    const HeldStream* held = find(host_.heldStreams, stream);
    const auto isOnIt = [&](const OpenBatch& open) {
      return open.layer == held->layer && open.stream == held->stream;
    };
    if (call.demand(held != nullptr, HOST_ERR_BAD_HANDLE) &&
        call.demand(std::none_of(host_.openBatches.begin(), host_.openBatches.end(), isOnIt),
                    HOST_ERR_BATCH_OPEN)) {
      *batch = ++host_.batches;
      host_.openBatches.push_back({*batch, held->layer, held->stream});
    }
  }
  call.line().handle("stream", "stream", stream);
  call.handed("batch", "batch", *batch);
  return call.finish();
}

HostError SuiteUser::addBatchKeyframe(Handle batch, T_Time time, std::int32_t* index) {
  PlayedCall call(host_, "AddBatchKeyframe", use(kKeyframe3));
  *index = 0;
  if (call.goesOn()) {
    OpenBatch* open = find(host_.openBatches, batch);
    if (call.demand(open != nullptr, HOST_ERR_BAD_HANDLE) &&
        call.demand(time.scale != 0 || host_.options.permissive, HOST_ERR_BAD_TIME)) {
      *index = static_cast<std::int32_t>(open->keys.size());
      open->keys.push_back(time);
    }
  }
  call.line().handle("batch", "batch", batch).integer("timeMode", 0);
  call.line().pair("time", time.value, time.scale);
  call.handedInteger("index", *index);
  return call.finish();
}

HostError SuiteUser::setBatchKeyframeValue(Handle batch, std::int32_t index, Handle stream,
                                           const Value& value) {
  PlayedCall call(host_, "SetBatchKeyframeValue", use(kKeyframe4));
  if (call.goesOn()) {
    OpenBatch* open = find(host_.openBatches, batch);
    const HeldStream* held = find(host_.heldStreams, stream);
    if (call.demand(open != nullptr && held != nullptr, HOST_ERR_BAD_HANDLE) &&
        call.demand(static_cast<std::size_t>(index) < open->keys.size(), HOST_ERR_BATCH_KEY) &&
        call.demand(host_.options.permissive || areFinite(value, open->stream), HOST_ERR_BAD_VALUE)) {
      open->valued.insert(index);
    }
  }
  call.line().handle("batch", "batch", batch).integer("index", index).handle("stream", "stream", stream);
  call.line().numbers("value", value.numbers);
  call.rounded(value.rounding);
  return call.finish();
}

HostError SuiteUser::endKeyframeBatch(Handle batch) {
  PlayedCall call(host_, "EndKeyframeBatch", use(kKeyframe3));
  OpenBatch* const open = find(host_.openBatches, batch);
  if (!call.goesOn()) {
    if (open != nullptr) open->excused = true;
  } else if (call.demand(open != nullptr, HOST_ERR_BAD_HANDLE)) {
    for (const std::int32_t index : open->valued) {
      host_.keys[{open->layer, open->stream}].insert(open->keys[static_cast<std::size_t>(index)]);
    }
    host_.openBatches.erase(host_.openBatches.begin() + (open - host_.openBatches.data()));
  }
  call.line().integer("commit", 1).handle("batch", "batch", batch);
  return call.finish();
}

}  // namespace secondreader
