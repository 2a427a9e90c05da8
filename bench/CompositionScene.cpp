// Long curves, all of which reach the composition.
#include "bench/SceneParts.h"
#include "bench/Scenes.h"

namespace bench {

Built writeComposition(std::ostream& out, double scale, std::uint64_t seed) {
  constexpr int kFrames = 1200;
  constexpr std::size_t kPlaceAndRotation = 6;
  SceneText scene(out, seed);
  scene.header("film");
  camera(scene, "camera0");
  const std::int64_t count = scaled(scale, 1000);
  for (std::int64_t i = 0; i < count; ++i) {
    const std::string name = numbered("marker", i);
    transform(scene, name);
    locator(scene, name + "_nullShape", name);
    const Channel& channel = kChannels[static_cast<std::size_t>(i) % kPlaceAndRotation];
    const std::string curve = name + "_" + std::string(channel.suffix);
    scene.curve(channel.curveType, curve, kFrames, 14, 100.0);
    scene.tangents(kFrames);
    scene.connect(curve + ".o", name + "." + std::string(channel.attribute));
  }
  scene.footer();
  return {1 + count, count * kFrames * kStreams};
}

}  // namespace bench
