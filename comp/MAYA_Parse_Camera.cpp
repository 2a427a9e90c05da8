// The lens of a camera layer: film size, zoom, and the place of its transform. Reads the resolution, the
// pixel aspect and `transforms`; calls the layer, stream and camera suites.
#include "comp/Conversions.h"
#include "hostapi/CameraSuite.h"
#include "hostapi/LayerStreams.h"
#include "hostapi/LayerSuite.h"
#include "maya/ListAccess.h"
#include "maya/MAYA_Parse.h"
#include "plugin/Globals.h"

namespace mayaimport {

void MAYA_Parse::SetCamera(VOR_Layer* layer, const MAYA_Camera* camera) {
  constexpr std::uint8_t kOff = 0;
  ThrowOnError(LayerSuite10().SetLayerFlag(layer, HOST_LAYER_FLAG_AIMED, kOff));
  SetUnguarded(layer, HOST_STREAM_POSITION, 0.0);
  const double filmSize = CalculatePixelFit(camera);
  const std::int32_t direction = camera->filmFit != 0 ? HOST_FILM_VERTICAL : HOST_FILM_HORIZONTAL;
  ThrowOnError(CameraSuite2().SetCameraFilmSize(layer, direction, &filmSize));
  SetUnguarded(layer, HOST_STREAM_ZOOM, CalculateZoom(camera, filmSize, nullptr));

  const std::int32_t parent = transformNames_.Find(camera->parent);
  if (parent == kNoIndex) return;
  const auto transform = FetchRecord<MAYA_Transform>(transforms, parent);
  SetTransform(layer, &transform);
}

// Deliberate: a value that cannot be set leaves the stream unreleased, and a failed release is a failure
// here. Guarding it as the other setters do would change which calls the host sees after a failure.
void MAYA_Parse::SetUnguarded(VOR_Layer* layer, std::int32_t streamId, double x) {
  VOR_Stream* const stream = AcquireStream(layer, streamId);
  const StreamValueRecord value{stream, {x, 0.0, 0.0, 0.0}};
  ThrowOnError(StreamSuite8().SetStreamValue(G_plugin_idL, stream, &value));
  ThrowOnError(StreamSuite7().ReleaseStream(stream));
}

double MAYA_Parse::CalculatePixelFit(const MAYA_Camera* camera) const {
  return (camera->filmFit != 0 ? camera->cameraAperture[1] : camera->cameraAperture[0]) * kPointsPerInch;
}

double MAYA_Parse::CalculateZoom(const MAYA_Camera* camera, double filmSize,
                                 const double* focalLength) const {
  const double focal =
      (focalLength != nullptr ? *focalLength : camera->focalLength) * kPointsPerInch / kMillimetersPerInch;
  const double imageSize = camera->filmFit != 0 ? static_cast<double>(resolutionHeight)
                                                : static_cast<double>(resolutionWidth) * CalculateHSF();
  return imageSize * focal / filmSize;
}

}  // namespace mayaimport
