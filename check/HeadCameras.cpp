// A camera in the head: its lens, what stands above it, and what drives each of its channels.
#include <algorithm>
#include <array>
#include <cmath>
#include <cstddef>
#include <numbers>
#include <string>
#include <string_view>

#include "check/HeadInternal.h"
#include "motion/Camera.h"
#include "motion/SceneCamera.h"
#include "scene/Attributes.h"

namespace check {
namespace {

// A chain can be as long as its file, and each of its cameras says its path.
constexpr std::size_t kLongestPath = 1000;

constexpr std::array<std::string_view, 4> kLensChannels = {"focalLength", "horizontalFilmAperture",
                                                           "verticalFilmAperture", "filmFit"};

constexpr std::array<std::string_view, 4> kFits = {"fill", "horizontal", "vertical", "overscan"};

std::size_t KeysOf(const scene::Scene& scene, scene::NodeId curve) {
  std::size_t keys = 0;
  for (const scene::Piece& piece : scene.Pieces(curve, "keyTimeValue")) {
    keys += static_cast<std::size_t>(piece.last - piece.first) + 1;
  }
  return keys;
}

template <std::size_t kCount>
std::vector<Drive> DrivesOf(const scene::Scene& scene, scene::NodeId node,
                            const std::array<std::string_view, kCount>& channels, diag::Lines& lines) {
  std::vector<Drive> drives;
  for (const std::string_view channel : channels) {
    const std::optional<scene::Driver> driver = scene.SourceOf(scene.PlugOf(node, channel));
    if (!driver) continue;
    const scene::Node& source = scene.node(driver->plug.node);
    Drive drive{.channel = std::string(channel),
                .node = std::string(source.name),
                .type = std::string(source.type),
                .keys = std::nullopt,
                .where = WhereIs(driver->connection->destinationPlace, lines)};
    if (source.type.starts_with("animCurve")) drive.keys = KeysOf(scene, driver->plug.node);
    drives.push_back(std::move(drive));
  }
  return drives;
}

Given<double> NumberOf(const scene::Scene& scene, scene::NodeId node, std::string_view attribute,
                       diag::Lines& lines) {
  Given<double> given{scene.Number(node, attribute).value_or(scene.Default(node, attribute).value_or(0.0))};
  if (const auto written = scene.Written(node, attribute)) given.where = WhereIs(written->range(), lines);
  return given;
}

Given<std::string> FitOf(const scene::Scene& scene, scene::NodeId camera, diag::Lines& lines) {
  const Given<double> code = NumberOf(scene, camera, "filmFit", lines);
  const bool known = code.value >= 0.0 && code.value < static_cast<double>(kFits.size());
  return {std::string(known ? kFits[static_cast<std::size_t>(code.value)] : kFits[1]), code.where};
}

double AngleOfView(const CameraHead& head, const scene::Scene& scene, scene::NodeId shape,
                   const motion::Picture& picture) {
  motion::Camera camera;
  camera.focalLength = head.focalLength.value;
  camera.horizontalAperture = head.horizontalAperture.value;
  camera.verticalAperture = head.verticalAperture.value;
  camera.filmFit = static_cast<int>(std::find(kFits.begin(), kFits.end(), head.fit.value) - kFits.begin());
  camera.lensSqueeze = scene.Number(shape, "lensSqueezeRatio").value_or(1.0);
  camera.cameraScale = scene.Number(shape, "cameraScale").value_or(1.0);
  const double width = motion::FilmWindowOf(camera, picture).width * motion::kMillimetresPerInch;
  return 2.0 * std::atan(width / (2.0 * motion::EffectiveFocalLength(camera))) * 180.0 / std::numbers::pi;
}

void DescribeChain(const scene::Scene& scene, const Camera& camera, diag::Lines& lines, CameraHead* head) {
  for (scene::NodeId id = camera.transform; id != scene::kNoNode; id = scene.node(id).parent) {
    // A longer chain is counted only so far, that reports do not grow faster than their scenes.
    if (head->chain.size() == Head::kMostLinks) {
      head->chainGoesOn = true;
      return;
    }
    head->chain.push_back(
        {std::string(scene.node(id).name), DrivesOf(scene, id, scene::kPlaceChannels, lines)});
  }
}

void DescribeLayer(const CameOver& cameOver, const CameOverLayer& layer, CameraHead* head) {
  head->cameOver = true;
  head->keys = layer.position.times.size();
  head->zoomKeys = layer.zoom.times.size();
  for (auto above = layer.parent; above && head->parents < cameOver.layers.size();
       above = cameOver.layers[*above].parent) {
    if (++head->parents == Head::kMostLinks) break;
  }
}

}  // namespace

CameraHead DescribeCamera(const scene::Scene& scene, const scene::Settings& settings,
                          const CameOver& cameOver, const Camera& camera, diag::Lines& lines) {
  CameraHead head;
  head.path = scene.PathOf(camera.shape, kLongestPath);
  head.where = WhereIs(scene.node(camera.shape).place, lines);
  head.focalLength = NumberOf(scene, camera.shape, "focalLength", lines);
  head.horizontalAperture = NumberOf(scene, camera.shape, "horizontalFilmAperture", lines);
  head.verticalAperture = NumberOf(scene, camera.shape, "verticalFilmAperture", lines);
  head.fit = FitOf(scene, camera.shape, lines);
  head.angleOfView = AngleOfView(head, scene, camera.shape, motion::PictureOf(settings));
  head.drives = DrivesOf(scene, camera.shape, kLensChannels, lines);
  DescribeChain(scene, camera, lines, &head);
  if (camera.layer != nullptr) DescribeLayer(cameOver, *camera.layer, &head);
  return head;
}

}  // namespace check
