// Many nodes and connections, few keys. Every other chain of groups that has locators ends in a
// marked one, and one chain ends in the camera, so that these chains become layers.
#include <vector>

#include "bench/SceneParts.h"
#include "bench/Scenes.h"

namespace bench {
namespace {

constexpr std::int64_t kGroupsInChain = 8;
constexpr std::int64_t kMarkedOneIn = 2;
constexpr std::int64_t kCameraChain = 1;  // not marked
constexpr int kKeys = 4;

std::string group(std::int64_t number) { return numbered("crowd_group_", number); }

std::int64_t lastOf(std::int64_t chain) { return (chain + 1) * kGroupsInChain - 1; }

// The number of groups, the first ones, that have a locator.
bool isMarked(std::int64_t chain, std::int64_t locators) {
  return chain % kMarkedOneIn == 0 && lastOf(chain) < locators;
}

void groups(SceneText& scene, std::int64_t count, std::int64_t locators) {
  for (std::int64_t i = 0; i < count; ++i) {
    transform(scene, group(i), i % kGroupsInChain == 0 ? std::string() : group(i - 1));
    scene.triple(".r", 0, scene.number(180), 0, 4).triple(".rp", 0, scene.number(2), 0, 4);
    if (i >= locators) continue;
    const std::int64_t chain = i / kGroupsInChain;
    const bool marks = i == lastOf(chain) && isMarked(chain, locators);
    locator(scene, numbered(marks ? "crowd_nullShape_" : "crowd_locatorShape_", i), group(i));
    scene.text("\tsetAttr \".los\" -type \"double3\" 0.5 0.5 0.5 ;\n");
  }
}

// Every other one is of a curve, the others are of messages. Returns which groups a curve drives.
std::vector<bool> connections(SceneText& scene, std::int64_t count, std::int64_t groupCount,
                              std::int64_t curves) {
  std::vector<bool> driven(static_cast<std::size_t>(groupCount));
  for (std::int64_t i = 0; i < count; ++i) {
    const std::int64_t destination = scene.below(groupCount);
    if (i % 2 == 0) {
      const Channel& channel = kChannels[static_cast<std::size_t>(i) % kChannels.size()];
      driven[static_cast<std::size_t>(destination)] = true;
      scene.connect(numbered("crowd_curve_", scene.below(curves)) + ".o",
                    group(destination) + "." + std::string(channel.attribute));
    } else {
      scene.connect(group(scene.below(groupCount)) + ".msg", group(destination) + ".dispLayer");
    }
  }
  return driven;
}

// Each group is a layer, and has keys where a curve drives it.
void addChain(std::int64_t chain, const std::vector<bool>& driven, Built* built) {
  built->layers += kGroupsInChain;
  for (std::int64_t i = chain * kGroupsInChain; i <= lastOf(chain); ++i) {
    if (driven[static_cast<std::size_t>(i)]) built->keys += kKeys * kStreams;
  }
}

}  // namespace

Built writeNodes(std::ostream& out, double scale, std::uint64_t seed) {
  SceneText scene(out, seed);
  scene.header("pal");
  const std::int64_t groupCount = scaled(scale, 15000, 2) * kGroupsInChain;
  const std::int64_t curves = scaled(scale, 10000);
  const std::int64_t locators = groupCount * 2 / 3;
  groups(scene, groupCount, locators);
  camera(scene, "camera0", group(lastOf(kCameraChain)));
  for (std::int64_t i = 0; i < curves; ++i) {
    scene.curve("animCurveTL", numbered("crowd_curve_", i), kKeys, 5, 100.0);
  }
  const std::vector<bool> driven = connections(scene, scaled(scale, 200000), groupCount, curves);
  scene.footer();

  Built built{.layers = 1};
  for (std::int64_t chain = 0; chain < groupCount / kGroupsInChain; ++chain) {
    if (isMarked(chain, locators) || chain == kCameraChain) addChain(chain, driven, &built);
  }
  return built;
}

}  // namespace bench
