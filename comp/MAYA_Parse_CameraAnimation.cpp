// A camera's animation: zoom keys from its focal-length curve, then the keys of its transform. Reads
// `curves`, `transforms` and the settings; calls the stream and keyframe suites.
#include "hostapi/KeyframeSuite.h"
#include "hostapi/LayerStreams.h"
#include "maya/ListAccess.h"
#include "maya/MAYA_Parse.h"
#include "plugin/Globals.h"
#include "plugin/Guarded.h"

namespace mayaimport {

void MAYA_Parse::ApplyCameraAnimation(VOR_Layer* layer, const MAYA_Camera* camera) {
  ApplyZoomAnimation(layer, camera);
  const std::int32_t parent = transformNames_.Find(camera->parent);
  if (parent == kNoIndex) return;
  const auto transform = FetchRecord<MAYA_Transform>(transforms, parent);
  ApplyTransformAnimation(layer, &transform);
}

void MAYA_Parse::ApplyZoomAnimation(VOR_Layer* layer, const MAYA_Camera* camera) {
  if (camera->focalLengthCurve < 0) return;
  VOR_Stream* stream = nullptr;
  VOR_AddKeyframesInfo* batch = nullptr;
  HostError kept = Guarded([&] {
    const auto curve = FetchRecord<MAYA_AnimCurve>(curves, camera->focalLengthCurve);
    // Deliberate: one key is enough here, while a channel of a transform is animated from two keys upwards.
    if (RecordCount(curve.keys) < 1) return;
    stream = AcquireStream(layer, HOST_STREAM_ZOOM);
    std::int32_t existing = 0;
    ThrowOnError(KeyframeSuite3().GetStreamKeyframeCount(stream, &existing));
    if (existing >= 1) {
      // Deliberate: a zoom that already has keys is left alone, and so is the stream: it is not released.
      stream = nullptr;
      return;
    }
    ThrowOnError(KeyframeSuite3().BeginKeyframeBatch(stream, &batch));
    InsertZoomKeys(batch, stream, camera, curve.keys);
  });
  if (batch != nullptr) KeepFirst(&kept, Guarded([&] { EndAddingKeyframes(batch); }));
  if (stream != nullptr) StreamSuite7().ReleaseStream(stream);
  ThrowOnError(kept);
}

void MAYA_Parse::InsertZoomKeys(VOR_AddKeyframesInfo* batch, VOR_Stream* stream, const MAYA_Camera* camera,
                                const RecordList* keys) {
  for (std::int64_t k = 0; k < RecordCount(keys); ++k) {
    const auto key = FetchRecord<MAYA_Key>(keys, k);
    const T_Time time = ConvertTime(key.time, k == 0 ? 1 : 0);
    const double zoom = CalculateZoom(camera, CalculatePixelFit(camera), &key.value);
    std::int32_t index = 0;
    ThrowOnError(KeyframeSuite3().AddBatchKeyframe(batch, HOST_TIME_MODE_COMP, &time, &index));
    const StreamValueRecord value{stream, {zoom, 0.0, 0.0, 0.0}};
    ThrowOnError(KeyframeSuite4().SetBatchKeyframeValue(batch, index, &value));
  }
}

}  // namespace mayaimport
