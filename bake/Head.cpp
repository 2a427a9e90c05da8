#include "bake/Head.h"

#include <algorithm>
#include <cmath>
#include <string_view>

#include "motion/Measures.h"
#include "motion/SceneCamera.h"
#include "scene/Settings.h"
#include "scene/Units.h"

namespace bake {
namespace {

constexpr std::string_view kDefaultLength = "centimeter";
constexpr std::string_view kDefaultRate = "film";

void ReadTimeUnit(const scene::Scene& scene, Head* head, diag::Collector* diagnostics) {
  const scene::UnitWord& unit = scene.timeUnit();
  head->timeUnit = kDefaultRate;
  if (unit.word.empty() || !scene::TimeUnitOf(unit.word)) return;
  if (motion::IsClockUnit(unit.word)) {
    diagnostics->Report(diag::Code::ClockTimeUnit, unit.place, {unit.word});
    head->unitsPerFrame = motion::UnitsPerFrame(scene);
  } else if (unit.word == "game") {
    head->timeUnit = "15fps";  // the importer takes the word for a unit that counts no frames
  } else {
    head->timeUnit = unit.word;
  }
}

// The importer takes whole pixels.
double WholePixels(double size) { return std::clamp(std::trunc(size), 1.0, 2147483647.0); }

}  // namespace

Head ReadHead(const scene::Scene& scene, diag::Collector* diagnostics) {
  Head head;
  const std::string_view length = scene.linearUnit().word;
  head.linearUnit = scene::LinearUnitOf(length) ? length : kDefaultLength;
  ReadTimeUnit(scene, &head, diagnostics);
  const scene::Settings settings = scene::ReadSettings(scene, *diagnostics);
  head.picture = motion::PictureOf(settings);
  head.picture.width = WholePixels(head.picture.width);
  head.picture.height = WholePixels(head.picture.height);
  if (settings.playback && settings.playback->value.first <= settings.playback->value.last) {
    const scene::FrameRange& range = settings.playback->value;
    head.playback = FrameSpan{range.first / head.unitsPerFrame, range.last / head.unitsPerFrame};
  }
  return head;
}

}  // namespace bake
