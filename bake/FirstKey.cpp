#include "bake/FirstKey.h"

#include <algorithm>
#include <string_view>
#include <unordered_set>

#include "bake/KeyedChannel.h"
#include "bake/Selection.h"
#include "diag/Collector.h"
#include "motion/Measures.h"

namespace bake {
namespace {

// The first key of each node that an import takes, and the smallest of them.
class FirstKeys {
 public:
  explicit FirstKeys(const scene::Scene& scene) : scene_(scene), measures_(motion::MeasuresOf(scene)) {}

  void TakeShape(scene::NodeId shape) {
    const auto lens = FindKeys(scene_, shape, "focalLength", measures_);
    if (lens) TakeKey(lens->curve.keys.front().time);
    // The reader has cut circles of parents. A shared chain is visited once.
    for (scene::NodeId node = scene_.node(shape).parent; node != scene::kNoNode && seen_.insert(node).second;
         node = scene_.node(node).parent) {
      TakeTransform(node);
    }
  }

  std::optional<double> smallest() const { return smallest_; }

 private:
  // A node is animated when one of its channels has two keys. Its keys then begin at the first key of its
  // first channel that has any.
  void TakeTransform(scene::NodeId node) {
    std::optional<double> first;
    bool animated = false;
    for (const std::string_view attribute : scene::kPlaceChannels) {
      const auto channel = FindKeys(scene_, node, attribute, measures_);
      if (!channel) continue;
      if (!first) first = channel->curve.keys.front().time;
      animated = animated || channel->curve.keys.size() > 1;
    }
    if (animated) TakeKey(*first);
  }

  void TakeKey(double seconds) {
    const double frame = seconds * measures_.framesPerSecond;
    smallest_ = std::min(smallest_.value_or(frame), frame);
  }

  const scene::Scene& scene_;
  motion::Measures measures_;
  std::unordered_set<scene::NodeId> seen_;
  std::optional<double> smallest_;
};

}  // namespace

std::optional<double> FirstKeyOfImport(const scene::Scene& scene) {
  diag::Collector ignored(scene.text());
  const Selection selection = Select(scene, {}, &ignored);
  FirstKeys keys(scene);
  for (const scene::NodeId camera : selection.cameras) keys.TakeShape(camera);
  for (const scene::NodeId locator : selection.locators) keys.TakeShape(locator);
  return keys.smallest();
}

}  // namespace bake
