#include "tools/mayascene/SceneNumbers.h"

#include <algorithm>
#include <new>
#include <string_view>

#include "bake/FirstKey.h"
#include "check/Times.h"
#include "diag/Collector.h"
#include "scene/Units.h"
#include "tools/mayascene/SceneText.h"

namespace mayascene {
namespace {

constexpr std::string_view kDefaultUnit = "cm";

}  // namespace

std::string linearUnitOf(const scene::Scene& scene) {
  const std::string_view word = scene.linearUnit().word;
  return std::string(scene::LinearUnitOf(word) ? word : kDefaultUnit);
}

std::optional<double> firstKeyOf(const scene::Scene& scene) {
  const std::optional<double> first = bake::FirstKeyOfImport(scene);
  return first && !check::CountsFrames(scene) ? 0.0 : first;
}

std::optional<double> lastKeyOf(const refhost::Composition& composition) {
  if (composition.frameRate.numerator <= 0 || composition.frameRate.denominator == 0) return std::nullopt;
  std::optional<double> last;
  for (const refhost::Layer* layer : composition.layers) {
    for (const refhost::Stream& stream : layer->streams) {
      if (stream.keyCount() == 0 || stream.keys->times.back().scale == 0) continue;
      const double frame = framesAt(stream.keys->times.back(), composition.frameRate);
      last = std::max(last.value_or(frame), frame);
    }
  }
  return last;
}

std::optional<SceneNumbers> numbersOf(const std::string& path, const refhost::Composition& composition) {
  try {
    std::string failure;
    const auto text = SceneText::open(path, &failure);
    if (text == nullptr) return std::nullopt;
    diag::Collector ignored(text->text());
    const scene::Scene scene = scene::Read(text->text(), ignored);
    SceneNumbers numbers;
    numbers.linearUnit = linearUnitOf(scene);
    numbers.lenses = lensExtrasByName(scene);
    const auto last = lastKeyOf(composition);
    if (!last) return numbers;
    numbers.firstFrame = firstKeyOf(scene);
    if (numbers.firstFrame) numbers.lastFrame = *numbers.firstFrame + *last;
    return numbers;
  } catch (const std::bad_alloc&) {
    return std::nullopt;
  }
}

SceneNumbers numbersOf(const BakedScene& baked) {
  SceneNumbers numbers;
  numbers.linearUnit = baked.linearUnit;
  for (const bake::CameraReport& camera : baked.report.cameras) {
    const auto lens = baked.lenses.find(camera.path);
    if (!camera.written || lens == baked.lenses.end()) continue;
    LensExtras extras = lens->second;
    extras.squeeze.reset();  // the bake has it in the aperture
    addLens(camera.name, extras, &numbers.lenses);
  }
  if (!baked.report.frames) return numbers;
  numbers.firstFrame = baked.report.frames->first;
  numbers.lastFrame = baked.report.frames->Last();
  return numbers;
}

}  // namespace mayascene
