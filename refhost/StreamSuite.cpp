// "QZGP Stream Suite" 7 and 8: a layer's animatable properties.
#include <string>

#include "refhost/Call.h"
#include "refhost/SuiteRegistry.h"

namespace refhost {
namespace {

// The tasks of every key. Their refusals are in functions of their own, which keeps them small.
struct Acquiring {
  static constexpr Operation kOperation = Operation::AcquireLayerStream;

  static HostError work(HostState& host, std::int32_t pluginId, VOR_Layer* layer, std::int32_t streamId,
                        VOR_Stream** stream) {
    if (pluginId != host.options.pluginId) [[unlikely]]
      return refusePluginId(kOperation, pluginId);
    Layer* const found = host.layer(layer);
    if (found == nullptr) [[unlikely]]
      return refuseHandle(kOperation, layer, HandleKind::Layer, "the layer");
    if (stream == nullptr) [[unlikely]]
      return refuseNull(kOperation, "the place for the stream");
    Stream* const property = ProjectEditor::findStream(*found, streamId);
    if (property == nullptr) [[unlikely]]
      return refuseNumber(layer, streamId);
    if (!host.streams.hasFreeSlot()) [[unlikely]]
      return workWithMoreSlots(host, pluginId, layer, streamId, stream);
    void* handle = nullptr;
    HeldStream* const held = host.streams.addToFreeSlot(&handle);
    held->layer = found;
    held->stream = property;
    *stream = static_cast<VOR_Stream*>(handle);
    return 0;
  }

  static void idle(Call& call, std::int32_t, VOR_Layer*, std::int32_t, VOR_Stream** stream) {
    call.handOutNothing(stream);
  }

  static void describe(TraceLine& line, std::int32_t pluginId, VOR_Layer* layer, std::int32_t streamId,
                       VOR_Stream** stream) {
    line.integer("pluginId", pluginId).handle("layer", layer).integer("streamId", streamId);
    line.handed("stream", stream);
  }

 private:
  // Makes a slot and begins again.
  [[gnu::cold, gnu::noinline]] static HostError workWithMoreSlots(HostState& host, std::int32_t pluginId,
                                                                  VOR_Layer* layer, std::int32_t streamId,
                                                                  VOR_Stream** stream) {
    if (host.streams.makeFreeSlot()) return work(host, pluginId, layer, streamId, stream);
    return refuse(kOperation, HOST_ERR_MEMORY, "too many streams are held");
  }

  [[gnu::cold, gnu::noinline]] static HostError refuseNumber(VOR_Layer* layer, std::int32_t streamId) {
    return refuse(
        kOperation, HOST_ERR_NO_SUCH_STREAM,
        HostState::live().codec.describe(layer) + " has no stream of the number " + std::to_string(streamId));
  }
};

struct Releasing {
  static constexpr Operation kOperation = Operation::ReleaseStream;

  static HostError work(HostState& host, VOR_Stream* stream) {
    if (host.streams.find(stream) == nullptr) [[unlikely]]
      return refuseHandle(kOperation, stream, HandleKind::Stream, "the stream");
    host.streams.remove(stream);
    return 0;
  }

  static void idle(Call& call, VOR_Stream* stream) {
    if (HeldStream* held = call.host().streams.find(stream)) held->releaseFailed = true;
  }

  static void describe(TraceLine& line, VOR_Stream* stream) { line.handle("stream", stream); }
};

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
  suite.AcquireLayerStream = perform<Acquiring>;
  suite.ReleaseStream = perform<Releasing>;
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
