// The picture of a camera: the part of the film back that it shows, and where a point appears. The camera
// looks along its -Z, +Y is up.
#pragma once

#include "motion/Matrix.h"

namespace motion {

constexpr double kMillimetresPerInch = 25.4;

// Codes of the scene.
namespace filmfit {
constexpr int kFill = 0;
constexpr int kHorizontal = 1;
constexpr int kVertical = 2;
constexpr int kOverscan = 3;
}  // namespace filmfit

// A perspective camera at one time, with the defaults of a scene.
struct Camera {
  double focalLength = 35.0;            // millimetres
  double horizontalAperture = 1.41732;  // inches, as all that follow but the factors
  double verticalAperture = 0.94488;
  int filmFit = filmfit::kHorizontal;
  double lensSqueeze = 1.0;
  double cameraScale = 1.0;
  double horizontalOffset = 0.0;
  double verticalOffset = 0.0;
  bool hasShake = false;
  double horizontalShake = 0.0;
  double verticalShake = 0.0;
  bool hasShakeOverscan = false;
  double shakeOverscan = 1.0;
};

// The picture that is rendered, in pixels.
struct Picture {
  double width = 960.0;
  double height = 540.0;
  double deviceAspect = 1.7777777;  // of the whole picture, as it is written
};

// Width by height of a pixel, and of the picture. A pixel that is nearly square counts as square.
double PixelAspect(const Picture& picture);
double DeviceAspect(const Picture& picture);

// Width by height of the film, times the squeeze of the lens.
double FilmAspect(const Camera& camera);

// The side of the film back that fills the picture: kHorizontal or kVertical.
int ResolvedFit(const Camera& camera, const Picture& picture);

// The part of the film plane that the picture shows, at the focal length: inches.
struct FilmWindow {
  double width;
  double height;
  double centreX;
  double centreY;
};

FilmWindow FilmWindowOf(const Camera& camera, const Picture& picture);

// The focal length in millimetres that gives the same picture with a camera scale of 1.
double EffectiveFocalLength(const Camera& camera);

// A place in the picture: 0, 0 at the lower left, 1, 1 at the upper right.
struct PicturePoint {
  double u;
  double v;
};

// Where a point in the camera's space appears, inside the picture or not. False for a point that is not in
// front of the camera, and where the camera has no picture.
bool Project(const Camera& camera, const Picture& picture, const Vector& point, PicturePoint* landed);

}  // namespace motion
