// A camera in the head: its lens, and what drives that.
#include <algorithm>
#include <array>
#include <cstddef>
#include <string>
#include <string_view>

#include "check/HeadInternal.h"
#include "motion/SceneCamera.h"

namespace check {
namespace {

constexpr std::array<std::string_view, 4> kLensChannels = {"focalLength", "horizontalFilmAperture",
                                                           "verticalFilmAperture", "filmFit"};
constexpr std::string_view kOrthographicWidth = "orthographicWidth";

constexpr std::array<std::string_view, 4> kFits = {"fill", "horizontal", "vertical", "overscan"};

Given<double> NumberOf(const HeadSource& source, scene::NodeId node, std::string_view attribute) {
  const scene::Scene& scene = source.scene;
  Given<double> given{scene.Number(node, attribute).value_or(scene.Default(node, attribute).value_or(0.0))};
  if (const auto written = scene.Written(node, attribute))
    given.where = WhereIs(written->range(), source.lines);
  return given;
}

Given<std::string> FitOf(const HeadSource& source, scene::NodeId camera) {
  const Given<double> code = NumberOf(source, camera, "filmFit");
  const bool known = code.value >= 0.0 && code.value < static_cast<double>(kFits.size());
  return {std::string(known ? kFits[static_cast<std::size_t>(code.value)] : kFits[1]), code.where};
}

motion::Camera StoredLens(const CameraHead& head, const scene::Scene& scene, scene::NodeId shape) {
  motion::Camera camera;
  camera.focalLength = head.focalLength.value;
  camera.horizontalAperture = head.horizontalAperture.value;
  camera.verticalAperture = head.verticalAperture.value;
  camera.filmFit = static_cast<int>(std::find(kFits.begin(), kFits.end(), head.fit.value) - kFits.begin());
  camera.lensSqueeze = scene.Number(shape, "lensSqueezeRatio").value_or(1.0);
  camera.cameraScale = scene.Number(shape, "cameraScale").value_or(1.0);
  return camera;
}

}  // namespace

CameraHead DescribeCamera(const HeadSource& source, const Camera& camera) {
  const scene::Scene& scene = source.scene;
  CameraHead head;
  DescribeShape(source, camera.shape, camera.layer, &head);
  head.focalLength = NumberOf(source, camera.shape, "focalLength");
  head.horizontalAperture = NumberOf(source, camera.shape, "horizontalFilmAperture");
  head.verticalAperture = NumberOf(source, camera.shape, "verticalFilmAperture");
  head.fit = FitOf(source, camera.shape);
  head.angleOfView = AngleOfView(StoredLens(head, scene, camera.shape), motion::PictureOf(source.settings));
  for (const std::string_view channel : kLensChannels) AddDrive(source, camera.shape, channel, &head.drives);
  if (scene.Number(camera.shape, "orthographic").value_or(0.0) != 0.0) {
    head.orthographicWidth = NumberOf(source, camera.shape, kOrthographicWidth);
    AddDrive(source, camera.shape, kOrthographicWidth, &head.drives);
  }
  if (camera.layer != nullptr) head.zoomKeys = camera.layer->zoom.times.size();
  return head;
}

}  // namespace check
