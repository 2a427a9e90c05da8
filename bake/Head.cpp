#include "bake/Head.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <string_view>

#include "motion/Measures.h"
#include "scene/Units.h"

namespace bake {
namespace {

constexpr std::string_view kDefaultLength = "centimeter";
constexpr std::string_view kDefaultRate = "film";
constexpr double kDefaultFramesPerSecond = 24.0;

// Units of time that count no frames.
constexpr std::array<std::string_view, 4> kClockUnits = {"sec", "min", "hour", "millisec"};

bool IsClockUnit(std::string_view word) {
  return std::find(kClockUnits.begin(), kClockUnits.end(), word) != kClockUnits.end();
}

void ReadTimeUnit(const scene::Scene& scene, Head* head, diag::Collector* diagnostics) {
  const scene::UnitWord& unit = scene.timeUnit();
  head->timeUnit = kDefaultRate;
  if (unit.word.empty() || !scene::TimeUnitOf(unit.word)) return;
  if (IsClockUnit(unit.word)) {
    diagnostics->Report(diag::Code::ClockTimeUnit, unit.place, {unit.word});
    head->unitsPerFrame = motion::MeasuresOf(scene).framesPerSecond / kDefaultFramesPerSecond;
  } else if (unit.word == "game") {
    head->timeUnit = "15fps";  // the importer takes the word for a unit that counts no frames
  } else {
    head->timeUnit = unit.word;
  }
}

motion::Picture ReadPicture(const scene::Scene& scene) {
  motion::Picture picture;
  const scene::NodeId node = scene.Find("defaultResolution");
  if (node == scene::kNoNode) return picture;
  const auto positive = [&](std::string_view attribute, double* value) {
    const auto written = scene.Written(node, attribute);
    const auto number = written ? written->Number() : std::nullopt;
    if (number && std::isfinite(*number) && *number > 0.0) *value = *number;
  };
  positive("width", &picture.width);
  positive("height", &picture.height);
  positive("deviceAspectRatio", &picture.deviceAspect);
  // The importer takes whole pixels.
  picture.width = std::clamp(std::trunc(picture.width), 1.0, 2147483647.0);
  picture.height = std::clamp(std::trunc(picture.height), 1.0, 2147483647.0);
  return picture;
}

}  // namespace

Head ReadHead(const scene::Scene& scene, diag::Collector* diagnostics) {
  Head head;
  const std::string_view length = scene.linearUnit().word;
  head.linearUnit = scene::LinearUnitOf(length) ? length : kDefaultLength;
  ReadTimeUnit(scene, &head, diagnostics);
  head.picture = ReadPicture(scene);
  return head;
}

}  // namespace bake
