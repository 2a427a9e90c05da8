// Values and keyframe batches on layer streams. Reads nothing of the scene; calls the stream and keyframe
// suites.
#include <utility>

#include "hostapi/KeyframeSuite.h"
#include "maya/MAYA_Parse.h"
#include "plugin/Globals.h"
#include "plugin/Guarded.h"

namespace mayaimport {

namespace {

// Releases the stream at the end of its life, unless Release was called before.
class StreamInUse {
 public:
  StreamInUse(QZGP_SuiteHandler& suites, VOR_Stream* handle) : suites_(suites), handle_(handle) {}
  ~StreamInUse() {
    if (handle_ != nullptr) GuardedAtBorder([this] { Release(); });
  }
  StreamInUse(const StreamInUse&) = delete;
  StreamInUse& operator=(const StreamInUse&) = delete;

  VOR_Stream* handle() const { return handle_; }

  // Lets an exception of the release through; the release is not tried again.
  void Release() {
    VOR_Stream* const handle = std::exchange(handle_, nullptr);
    if (handle != nullptr) suites_.StreamSuite7().ReleaseStream(handle);
  }

 private:
  QZGP_SuiteHandler& suites_;
  VOR_Stream* handle_;
};

}  // namespace

VOR_Stream* MAYA_Parse::AcquireStream(VOR_Layer* layer, std::int32_t streamId) {
  VOR_Stream* stream = nullptr;
  ThrowOnError(StreamSuite7().AcquireLayerStream(G_plugin_idL, layer, streamId, &stream));
  return stream;
}

// Works with a stream of the layer and releases it, whatever happens. The code of the release is ignored.
template <typename Work>
void MAYA_Parse::UseStream(VOR_Layer* layer, std::int32_t streamId, Work&& work) {
  StreamInUse stream(*this, AcquireStream(layer, streamId));
  const HostError code = Guarded([&] { return work(stream.handle()); });
  stream.Release();
  ThrowOnError(code);
}

void MAYA_Parse::SetStream(VOR_Layer* layer, std::int32_t streamId, double x, double y, double z) {
  UseStream(layer, streamId, [&](VOR_Stream* stream) {
    const StreamValueRecord value{stream, {x, y, z, 0.0}};
    return StreamSuite8().SetStreamValue(G_plugin_idL, stream, &value);
  });
}

void MAYA_Parse::SetOneDStream(VOR_Layer* layer, std::int32_t streamId, double value) {
  SetStream(layer, streamId, value, 0.0, 0.0);
}

void MAYA_Parse::SetTwoDStream(VOR_Layer* layer, std::int32_t streamId, double x, double y) {
  SetStream(layer, streamId, x, y, 0.0);
}

void MAYA_Parse::SetThreeDStream(VOR_Layer* layer, std::int32_t streamId, double x, double y, double z) {
  SetStream(layer, streamId, x, y, z);
}

void MAYA_Parse::StartAddingKeyframes(VOR_Layer* layer, std::int32_t streamId, VOR_AddKeyframesInfo** batch) {
  UseStream(layer, streamId,
            [&](VOR_Stream* stream) { return KeyframeSuite3().BeginKeyframeBatch(stream, batch); });
}

void MAYA_Parse::InsertKeyframe(VOR_AddKeyframesInfo* batch, VOR_Layer* layer, std::int32_t streamId,
                                const T_Time* time, double x, double y, double z) {
  UseStream(layer, streamId, [&](VOR_Stream* stream) {
    std::int32_t index = 0;
    const HostError code = KeyframeSuite3().AddBatchKeyframe(batch, HOST_TIME_MODE_COMP, time, &index);
    if (code != kNoError) return code;
    const StreamValueRecord value{stream, {x, y, z, 0.0}};
    return KeyframeSuite4().SetBatchKeyframeValue(batch, index, &value);
  });
}

void MAYA_Parse::EndAddingKeyframes(VOR_AddKeyframesInfo* batch) {
  constexpr std::int32_t kCommit = 1;
  KeyframeSuite3().EndKeyframeBatch(kCommit, batch);
}

}  // namespace mayaimport
