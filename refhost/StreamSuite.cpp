// "QZGP Stream Suite" 7 and 8: a layer's animatable properties.
#include <string>

#include "refhost/Call.h"
#include "refhost/SuiteShelf.h"

namespace refhost {
namespace {

// The sentences of the operations that are called for every key are put together apart from them.
[[gnu::cold, gnu::noinline]] void refuseStreamNumber(Call& call, VOR_Layer* layer, std::int32_t streamId) {
  call.refuse(HOST_ERR_NO_SUCH_STREAM,
              call.host().codec.describe(layer) + " has no stream of the number " + std::to_string(streamId));
}

[[gnu::cold, gnu::noinline]] void refuseMoreStreams(Call& call) {
  call.refuse(HOST_ERR_MEMORY, "too many streams are held");
}

void acquireLayerStream(Call& call, VOR_Layer* layer, std::int32_t streamId, VOR_Stream** stream) {
  Layer* found = call.layer(layer);
  if (found == nullptr || !call.given(stream, "the place for the stream")) return;
  Stream* property = ProjectEditor::findStream(*found, streamId);
  if (property == nullptr) return refuseStreamNumber(call, layer, streamId);
  void* handle = nullptr;
  HeldStream* held = call.host().streams.add(&handle);
  if (held == nullptr) return refuseMoreStreams(call);
  held->layer = found;
  held->stream = property;
  *stream = static_cast<VOR_Stream*>(handle);
}

[[gnu::noinline]] HostError acquireLayerStreamWatched(std::int32_t pluginId, VOR_Layer* layer,
                                                      std::int32_t streamId, VOR_Stream** stream) {
  Call call(Operation::AcquireLayerStream);
  if (call.goesOn(stream) && call.isPluginId(pluginId)) acquireLayerStream(call, layer, streamId, stream);
  if (TraceLine* line = call.traced()) {
    line->integer("pluginId", pluginId).handle("layer", layer).integer("streamId", streamId);
    line->handed("stream", stream);
  }
  return call.finish();
}

// The ordinary call, kept short because an import makes it for every key of every stream: nobody watches, and
// there is nothing to refuse. Every other call goes the long way.
HostError AcquireLayerStream(std::int32_t pluginId, VOR_Layer* layer, std::int32_t streamId,
                             VOR_Stream** stream) {
  HostState& host = HostState::live();
  if (!host.watched() && pluginId == host.options.pluginId && stream != nullptr &&
      host.codec.isOf(HandleKind::Layer, layer)) [[likely]] {
    Layer* const found = host.editor.layer(HandleCodec::lastingNumber(layer));
    Stream* const property = found == nullptr ? nullptr : ProjectEditor::findStream(*found, streamId);
    if (property != nullptr && host.streams.hasFreeSlot()) [[likely]] {
      void* handle = nullptr;
      HeldStream* const held = host.streams.addToFreeSlot(&handle);
      host.rehearsal.count(Operation::AcquireLayerStream);
      held->layer = found;
      held->stream = property;
      *stream = static_cast<VOR_Stream*>(handle);
      return 0;
    }
  }
  return acquireLayerStreamWatched(pluginId, layer, streamId, stream);
}

[[gnu::noinline]] HostError releaseStreamWatched(VOR_Stream* stream) {
  Call call(Operation::ReleaseStream);
  if (call.goesOn()) {
    if (call.stream(stream) != nullptr) call.host().streams.remove(stream);
  } else if (HeldStream* held = call.host().streams.find(stream)) {
    held->releaseFailed = true;
  }
  if (TraceLine* line = call.traced()) line->handle("stream", stream);
  return call.finish();
}

// As short as AcquireLayerStream.
HostError ReleaseStream(VOR_Stream* stream) {
  HostState& host = HostState::live();
  if (!host.watched() && host.streams.find(stream) != nullptr) [[likely]] {
    host.rehearsal.count(Operation::ReleaseStream);
    host.streams.remove(stream);
    return 0;
  }
  return releaseStreamWatched(stream);
}

void setStreamValue(Call& call, VOR_Stream* stream, const StreamValueRecord* value) {
  HeldStream* held = call.stream(stream);
  if (held == nullptr || !call.given(value, "the value record")) return;
  const HeldStream* recorded = call.stream(value->stream, "the record's stream");
  if (recorded == nullptr) return;
  const HandleCodec& codec = call.host().codec;
  if (recorded->stream != held->stream) {
    call.refuse(HOST_ERR_BAD_HANDLE, "the record's stream is " + codec.describe(value->stream) + " and not " +
                                         codec.describe(stream));
    return;
  }
  if (!call.areFinite(value->value, held->stream->dimension, "the value")) return;
  ProjectEditor::setValue(*held->stream, value->value);
  held->valueSet = true;
}

HostError SetStreamValue(std::int32_t pluginId, VOR_Stream* stream, const StreamValueRecord* value) {
  Call call(Operation::SetStreamValue);
  if (call.goesOn() && call.isPluginId(pluginId)) setStreamValue(call, stream, value);
  if (HeldStream* held = call.host().streams.find(stream)) held->valueFailed = call.failed();
  if (TraceLine* line = call.traced()) {
    line->integer("pluginId", pluginId).handle("stream", stream);
    line->recordValues("value", value);
  }
  return call.finish();
}

constexpr QZGP_StreamSuite7 table7() {
  QZGP_StreamSuite7 suite{};
  suite.AcquireLayerStream = AcquireLayerStream;
  suite.ReleaseStream = ReleaseStream;
  return suite;
}

constexpr QZGP_StreamSuite8 table8() {
  QZGP_StreamSuite8 suite{};
  suite.SetStreamValue = SetStreamValue;
  return suite;
}

}  // namespace

constinit const QZGP_StreamSuite7 kStreamSuite7 = table7();
constinit const QZGP_StreamSuite8 kStreamSuite8 = table8();

}  // namespace refhost
