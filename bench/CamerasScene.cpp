// Many cameras with few keys each, to be baked over many frames.
#include "bench/SceneParts.h"
#include "bench/Scenes.h"

namespace bench {
namespace {

constexpr int kKeys = 10;
constexpr int kFramesToNextKey = 111;  // from frame 1 to frame 1000

void fewKeys(SceneText& scene, std::string_view type, const std::string& name, double middle, double range) {
  scene.node(type, name).text("\tsetAttr \".tan\" 18;\n\tsetAttr \".wgt\" no;\n\tsetAttr -s ");
  scene.integer(kKeys).text(" \".ktv[0:").integer(kKeys - 1).text("]\" ");
  for (int key = 0; key < kKeys; ++key) {
    scene.text(" ").integer(1 + key * kFramesToNextKey).text(" ").real(middle + scene.number(range), 14);
  }
  scene.text(";\n");
}

}  // namespace

// Every other camera is under a group and has another rotation order; every fourth has an animated lens.
Built writeCameras(std::ostream& out, double scale, std::uint64_t seed) {
  constexpr std::size_t kPlaceAndRotation = 6;
  SceneText scene(out, seed);
  scene.header("film");
  const std::int64_t count = scaled(scale, 1000);
  Built built;
  for (std::int64_t i = 0; i < count; ++i) {
    const std::string name = numbered("shotCam", i);
    const bool grouped = i % 2 == 0;
    if (grouped) transform(scene, name + "_group");
    camera(scene, name, grouped ? name + "_group" : "");
    built.layers += grouped ? 2 : 1;
    built.keys += kKeys * kStreams;
    for (std::size_t channel = 0; channel < kPlaceAndRotation; ++channel) {
      const Channel& one = kChannels[channel];
      const std::string curve = name + "_" + std::string(one.suffix);
      fewKeys(scene, one.curveType, curve, 0.0, 90.0);
      scene.connect(curve + ".o", name + "." + std::string(one.attribute));
    }
    if (i % 4 != 0) continue;
    fewKeys(scene, "animCurveTU", name + "_lens", 35.0, 10.0);
    built.keys += kKeys;
    scene.connect(name + "_lens.o", name + "Shape.fl");
  }
  scene.footer();
  return built;
}

}  // namespace bench
