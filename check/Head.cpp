#include "check/Head.h"

#include <algorithm>

#include "check/HeadInternal.h"
#include "scene/SpecialNames.h"

namespace check {
namespace {

template <typename T>
Given<T> GivenBy(const scene::Said<T>& said, diag::Lines& lines) {
  Given<T> given{said.value};
  if (said.place) given.where = WhereIs(*said.place, lines);
  return given;
}

Given<std::string> UnitGivenBy(const scene::UnitWord& unit, const char* otherwise, diag::Lines& lines) {
  if (unit.word.empty()) return {otherwise};
  return {std::string(unit.word), WhereIs(unit.place, lines)};
}

void AddRange(const char* what, const std::optional<scene::Said<scene::FrameRange>>& said, diag::Lines& lines,
              std::vector<NamedFrames>* ranges) {
  if (!said || !said->place) return;
  ranges->push_back({what, said->value.first, said->value.last, WhereIs(*said->place, lines)});
}

std::size_t CountOf(LayerKind kind, const CameOver& cameOver) {
  return static_cast<std::size_t>(
      std::count_if(cameOver.layers.begin(), cameOver.layers.end(),
                    [kind](const CameOverLayer& layer) { return layer.kind == kind; }));
}

void DescribeCameras(const HeadSource& source, Head* head) {
  std::vector<scene::NodeId> shapes;
  for (const Camera& camera : source.cameras) {
    if (scene::IsStartupCamera(source.scene.node(camera.shape)) && camera.layer == nullptr) continue;
    AddOrCount(source, &head->cameras, &head->camerasNotShown, [&] {
      shapes.push_back(camera.shape);
      return DescribeCamera(source, camera);
    });
  }
  DescribeLensesOverFrames(source, shapes, &head->cameras);
}

}  // namespace

Where WhereIs(const diag::Range& range, diag::Lines& lines) { return {range, lines.At(range.offset)}; }

Head ReadHead(const HeadSource& source) {
  const scene::Scene& scene = source.scene;
  const scene::Settings& settings = source.settings;
  diag::Lines& lines = source.lines;
  Head head;
  head.isScene = true;
  head.product = settings.product;
  head.linearUnit = UnitGivenBy(scene.linearUnit(), "centimeter", lines);
  head.angularUnit = UnitGivenBy(scene.angularUnit(), "degree", lines);
  head.timeUnit = UnitGivenBy(scene.timeUnit(), "film", lines);
  head.framesPerSecond = settings.rate.value.perSecond();
  AddRange("playback", settings.playback, lines, &head.ranges);
  AddRange("animation", settings.animation, lines, &head.ranges);
  AddRange("render", settings.render, lines, &head.ranges);
  head.width = GivenBy(settings.width, lines);
  head.height = GivenBy(settings.height, lines);
  head.pixelAspect = GivenBy(settings.deviceAspect, lines);
  head.pixelAspect.value = settings.pixelAspect();
  DescribeCameras(source, &head);
  DescribeLocators(source, &head);
  DescribeLookAts(source, &head);
  head.camerasThatCame = CountOf(LayerKind::Camera, source.cameOver);
  head.nullsThatCame = CountOf(LayerKind::Null, source.cameOver);
  head.composition = source.cameOver.composition;
  return head;
}

}  // namespace check
