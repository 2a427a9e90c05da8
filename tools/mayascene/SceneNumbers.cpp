#include "tools/mayascene/SceneNumbers.h"

#include <algorithm>
#include <new>
#include <string_view>
#include <unordered_set>

#include "bake/KeyedChannel.h"
#include "bake/Selection.h"
#include "check/Times.h"
#include "diag/Collector.h"
#include "motion/Measures.h"
#include "scene/Units.h"
#include "tools/mayascene/SceneText.h"

namespace mayascene {
namespace {

constexpr std::string_view kDefaultUnit = "cm";

// The first key of each node that an import takes, and the smallest of them.
class FirstKeys {
 public:
  explicit FirstKeys(const scene::Scene& scene) : scene_(scene), measures_(motion::MeasuresOf(scene)) {}

  void takeShape(scene::NodeId shape) {
    const auto lens = bake::FindKeys(scene_, shape, "focalLength", measures_);
    if (lens) takeKey(lens->curve.keys.front().time);
    // A circle of parents is cut by the reader; a shared chain is gone up once.
    for (scene::NodeId node = scene_.node(shape).parent; node != scene::kNoNode && seen_.insert(node).second;
         node = scene_.node(node).parent) {
      takeTransform(node);
    }
  }

  std::optional<double> smallest() const { return smallest_; }

 private:
  // Of a node with a channel of two keys all channels count from its first channel that has a key.
  void takeTransform(scene::NodeId node) {
    std::optional<double> first;
    bool animated = false;
    for (const std::string_view attribute : bake::kPlaceChannels) {
      const auto channel = bake::FindKeys(scene_, node, attribute, measures_);
      if (!channel) continue;
      if (!first) first = channel->curve.keys.front().time;
      animated = animated || channel->curve.keys.size() > 1;
    }
    if (animated) takeKey(*first);
  }

  void takeKey(double seconds) {
    const double frame = seconds * measures_.framesPerSecond;
    smallest_ = std::min(smallest_.value_or(frame), frame);
  }

  const scene::Scene& scene_;
  motion::Measures measures_;
  std::unordered_set<scene::NodeId> seen_;
  std::optional<double> smallest_;
};

}  // namespace

std::string linearUnitOf(const scene::Scene& scene) {
  const std::string_view word = scene.linearUnit().word;
  return std::string(scene::LinearUnitOf(word) ? word : kDefaultUnit);
}

std::optional<double> firstKeyOf(const scene::Scene& scene) {
  diag::Collector ignored(scene.text());
  const bake::Selection selection = bake::Select(scene, {}, &ignored);
  FirstKeys keys(scene);
  for (const scene::NodeId camera : selection.cameras) keys.takeShape(camera);
  for (const scene::NodeId locator : selection.locators) keys.takeShape(locator);
  if (keys.smallest() && !check::CountsFrames(scene)) return 0.0;
  return keys.smallest();
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
  if (!baked.report.frames) return numbers;
  numbers.firstFrame = baked.report.frames->first;
  numbers.lastFrame = baked.report.frames->Last();
  return numbers;
}

}  // namespace mayascene
