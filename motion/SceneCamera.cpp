#include "motion/SceneCamera.h"

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
};

constexpr std::string_view kNames[] = {
    "focalLength",   "horizontalFilmAperture", "verticalFilmAperture", "filmFit",      "lensSqueezeRatio",
    "cameraScale",   "horizontalFilmOffset",   "verticalFilmOffset",   "shakeEnabled", "horizontalShake",
    "verticalShake", "shakeOverscanEnabled",   "shakeOverscan",
};

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
