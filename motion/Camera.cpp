#include "motion/Camera.h"

#include <cmath>

namespace motion {
namespace {

constexpr double kNearlySquare = 0.01;

double FilmWidth(const Camera& camera) {
  const double width = camera.horizontalAperture * camera.lensSqueeze;
  return camera.hasShakeOverscan ? width * camera.shakeOverscan : width;
}

double FilmHeight(const Camera& camera) {
  return camera.hasShakeOverscan ? camera.verticalAperture * camera.shakeOverscan : camera.verticalAperture;
}

}  // namespace

double PixelAspect(const Picture& picture) {
  const double aspect = picture.deviceAspect * picture.height / picture.width;
  return std::fabs(aspect - 1.0) <= kNearlySquare ? 1.0 : aspect;
}

double DeviceAspect(const Picture& picture) { return PixelAspect(picture) * picture.width / picture.height; }

double FilmAspect(const Camera& camera) { return FilmWidth(camera) / FilmHeight(camera); }

int ResolvedFit(const Camera& camera, const Picture& picture) {
  const bool filmIsWider = FilmAspect(camera) > DeviceAspect(picture);
  switch (camera.filmFit) {
    case filmfit::kFill:
      return filmIsWider ? filmfit::kVertical : filmfit::kHorizontal;
    case filmfit::kOverscan:
      return filmIsWider ? filmfit::kHorizontal : filmfit::kVertical;
    case filmfit::kVertical:
      return filmfit::kVertical;
    default:
      return filmfit::kHorizontal;
  }
}

FilmWindow FilmWindowOf(const Camera& camera, const Picture& picture) {
  const double aspect = DeviceAspect(picture);
  FilmWindow window{};
  if (ResolvedFit(camera, picture) == filmfit::kHorizontal) {
    window.width = FilmWidth(camera);
    window.height = window.width / aspect;
  } else {
    window.height = FilmHeight(camera);
    window.width = window.height * aspect;
  }
  window.centreX = camera.horizontalOffset;
  window.centreY = camera.verticalOffset;
  if (camera.hasShake) {
    window.centreX += camera.horizontalShake;
    window.centreY += camera.verticalShake;
  }
  return window;
}

double EffectiveFocalLength(const Camera& camera) { return camera.focalLength / camera.cameraScale; }

bool Project(const Camera& camera, const Picture& picture, const Vector& point, PicturePoint* landed) {
  if (!(point.z < 0.0)) return false;
  const double enlarged = EffectiveFocalLength(camera) / kMillimetresPerInch / -point.z;
  const FilmWindow window = FilmWindowOf(camera, picture);
  const PicturePoint place{0.5 + (point.x * enlarged - window.centreX) / window.width,
                           0.5 + (point.y * enlarged - window.centreY) / window.height};
  if (!std::isfinite(place.u) || !std::isfinite(place.v)) return false;
  *landed = place;
  return true;
}

}  // namespace motion
