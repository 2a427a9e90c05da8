#include "motion/SceneCamera.h"

#include <charconv>
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
};

constexpr std::string_view kNames[] = {
    "focalLength",   "horizontalFilmAperture", "verticalFilmAperture", "filmFit",      "lensSqueezeRatio",
    "cameraScale",   "horizontalFilmOffset",   "verticalFilmOffset",   "shakeEnabled", "horizontalShake",
    "verticalShake", "shakeOverscanEnabled",   "shakeOverscan",
};

constexpr int kFirstWidePicture = 2013;  // the version from which on the default is 960 by 540

// The year of the version that a scene requires, 0 where it does not say. Older versions have small numbers.
int VersionOf(const scene::Scene& scene) {
  int version = 0;
  for (const scene::Requirement& requirement : scene.requirements()) {
    if (requirement.name != "maya") continue;
    const std::string_view text = requirement.version;
    (void)std::from_chars(text.data(), text.data() + text.size(), version);
  }
  return version;
}

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

Picture PictureOf(const scene::Scene& scene) {
  const int version = VersionOf(scene);
  Picture picture;
  if (version != 0 && version < kFirstWidePicture) picture = {640.0, 480.0, 1.3333333};
  const scene::NodeId node = scene.Find("defaultResolution");
  if (node == scene::kNoNode) return picture;
  picture.width = scene.Number(node, "width").value_or(picture.width);
  picture.height = scene.Number(node, "height").value_or(picture.height);
  picture.deviceAspect = scene.Number(node, "deviceAspectRatio").value_or(picture.deviceAspect);
  return picture;
}

}  // namespace motion
