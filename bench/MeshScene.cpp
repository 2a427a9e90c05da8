// Mostly geometry, which an import skips.
#include "bench/SceneParts.h"
#include "bench/Scenes.h"

namespace bench {

Built writeMesh(std::ostream& out, double scale, std::uint64_t seed) {
  constexpr int kMeshes = 90;
  constexpr int kCameras = 4;
  constexpr int kFrames = 240;
  SceneText scene(out, seed);
  scene.header("film");
  const std::int64_t vertices = scaled(scale, 10500);
  for (int i = 0; i < kMeshes; ++i) mesh(scene, numbered("mesh", i), vertices);
  for (int i = 0; i < kCameras; ++i) {
    const std::string name = numbered("camera", i);
    camera(scene, name);
    animate(scene, name, kFrames, 9, 0, 6);
  }
  scene.footer();
  return {kCameras, kCameras * kFrames * kStreams};
}

}  // namespace bench
