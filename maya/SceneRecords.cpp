#include "maya/SceneRecords.h"

#include <algorithm>
#include <iterator>

namespace mayaimport {

MAYA_Transform DefaultTransform() {
  MAYA_Transform transform{};
  std::fill(std::begin(transform.scale), std::end(transform.scale), 1.0);
  std::fill(std::begin(transform.curve), std::end(transform.curve), kNoIndex);
  return transform;
}

MAYA_Camera DefaultCamera() {
  MAYA_Camera camera{};
  camera.cameraAperture[0] = 1.4173;
  camera.cameraAperture[1] = 0.9449;
  camera.focalLength = 35.0;
  camera.focalLengthCurve = kNoIndex;
  return camera;
}

}  // namespace mayaimport
