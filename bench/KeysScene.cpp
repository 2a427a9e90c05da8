// Baked skeletons: chains of joints, a curve for every channel. Every other chain carries a marked locator at
// its end, and one carries the camera, so that these chains become layers with all their keys.
#include "bench/SceneParts.h"
#include "bench/Scenes.h"

namespace bench {

Built writeKeys(std::ostream& out, double scale, std::uint64_t seed) {
  constexpr std::int64_t kJointsInChain = 10;
  constexpr std::int64_t kMarkedOneIn = 2;
  constexpr int kFrames = 240;
  SceneText scene(out, seed);
  scene.header("film");
  const std::int64_t joints = scaled(scale, 300, 2) * kJointsInChain;
  Built built;
  const auto addChain = [&built] {
    built.layers += kJointsInChain;
    built.keys += kJointsInChain * kFrames * kStreams;
  };
  for (std::int64_t i = 0; i < joints; ++i) {
    const std::string name = numbered("joint", i);
    const bool isFirst = i % kJointsInChain == 0;
    const bool isLast = i % kJointsInChain == kJointsInChain - 1;
    transform(scene, name, isFirst ? std::string() : numbered("joint", i - 1));
    if (isLast && i / kJointsInChain % kMarkedOneIn == 0) {
      locator(scene, name + "_nullShape", name);
      addChain();
    }
    animate(scene, name, kFrames, 10, 0, kChannels.size());
  }
  // Under the last joint of the second chain, which has no locator.
  camera(scene, "camera0", numbered("joint", 2 * kJointsInChain - 1));
  ++built.layers;
  addChain();
  scene.footer();
  return built;
}

}  // namespace bench
