#include "motion/SceneCamera.h"

#include <cmath>

#include "motion/ConstraintBinding.h"

namespace motion {
namespace {

enum Attribute : std::size_t {
  kFocalLength,
  kHorizontalAperture,
  kVerticalAperture,
  kFilmFit,
  kLensSqueeze,
  kCameraScale,
  kHorizontalOffset,
  kVerticalOffset,
  kShakeEnabled,
  kHorizontalShake,
  kVerticalShake,
  kShakeOverscanEnabled,
  kShakeOverscan,
  kFilmFitOffset,
  kPreScale,
  kPostScale,
  kFilmTranslateH,
  kFilmTranslateV,
  kFilmRoll,
  kFilmRollControl,
  kPanZoomEnabled,
  kRenderPanZoom,
  kHorizontalPan,
  kVerticalPan,
  kZoom,
};

constexpr std::string_view kNames[] = {
    "focalLength",    "horizontalFilmAperture", "verticalFilmAperture", "filmFit",       "lensSqueezeRatio",
    "cameraScale",    "horizontalFilmOffset",   "verticalFilmOffset",   "shakeEnabled",  "horizontalShake",
    "verticalShake",  "shakeOverscanEnabled",   "shakeOverscan",        "filmFitOffset", "preScale",
    "postScale",      "filmTranslateH",         "filmTranslateV",       "filmRollValue", "filmRollControl",
    "panZoomEnabled", "renderPanZoom",          "horizontalPan",        "verticalPan",   "zoom",
};

// Nearer to each other than this two ratios are the same.
constexpr double kSameRatio = 1e-9;

}  // namespace

SceneCamera::SceneCamera(Evaluator* evaluator, scene::NodeId shape) : evaluator_(evaluator) {
  static_assert(std::size(kNames) == kNumbers);
  for (std::size_t i = 0; i < kNumbers; ++i) numbers_[i] = evaluator->Number(shape, kNames[i]);
}

Camera SceneCamera::Now() const {
  Camera camera;
  camera.focalLength = Value(kFocalLength);
  camera.horizontalAperture = Value(kHorizontalAperture);
  camera.verticalAperture = Value(kVerticalAperture);
  camera.filmFit = CodeOf(Value(kFilmFit));
  camera.lensSqueeze = Value(kLensSqueeze);
  camera.cameraScale = Value(kCameraScale);
  camera.horizontalOffset = Value(kHorizontalOffset);
  camera.verticalOffset = Value(kVerticalOffset);
  camera.hasShake = Value(kShakeEnabled) != 0.0;
  camera.horizontalShake = Value(kHorizontalShake);
  camera.verticalShake = Value(kVerticalShake);
  camera.hasShakeOverscan = Value(kShakeOverscanEnabled) != 0.0;
  camera.shakeOverscan = Value(kShakeOverscan);
  return camera;
}

bool SceneCamera::HasFurtherChanges(const Picture& picture) const {
  const bool scaled = Value(kPreScale) != 1.0 || Value(kPostScale) != 1.0;
  const bool moved = Value(kFilmTranslateH) != 0.0 || Value(kFilmTranslateV) != 0.0;
  const bool rolled = Value(kFilmRoll) != 0.0 || Value(kFilmRollControl) != 0.0;
  const bool panned = Value(kHorizontalPan) != 0.0 || Value(kVerticalPan) != 0.0 || Value(kZoom) != 1.0;
  const bool panIsRendered = Value(kPanZoomEnabled) != 0.0 && Value(kRenderPanZoom) != 0.0;
  const bool gatesDiffer = std::fabs(FilmAspect(Now()) / DeviceAspect(picture) - 1.0) > kSameRatio;
  const bool offset = Value(kFilmFitOffset) != 0.0 && gatesDiffer;
  return scaled || moved || rolled || (panned && panIsRendered) || offset;
}

bool SceneCamera::Moves() const {
  for (const NumberId number : numbers_) {
    if (evaluator_->Moves(number)) return true;
  }
  return false;
}

Picture PictureOf(const scene::Settings& settings) {
  return {settings.width.value, settings.height.value, settings.deviceAspect.value};
}

}  // namespace motion
