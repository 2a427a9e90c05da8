#include "bench/ShotParts.h"

namespace bench {

void sparseCurve(SceneText& scene, std::string_view type, const std::string& name, int keys, bool fixed) {
  constexpr std::string_view kEnds[] = {"kix", "kiy", "kox", "koy"};
  scene.node(type, name).text("\tsetAttr \".tan\" 18;\n\tsetAttr \".wgt\" no;\n\tsetAttr");
  if (keys > 1) scene.text(" -s ").integer(keys).text(" \".ktv[0:").integer(keys - 1).text("]\" ");
  if (keys == 1) scene.text(" \".ktv[0]\" ");
  std::int64_t frame = 1001;
  for (int k = 0; k < keys; ++k) {
    scene.text(k % 4 == 3 ? "\n\t\t " : " ").integer(frame).text(" ").real(scene.number(90), 14);
    frame += 1 + scene.below(23);
  }
  scene.text(";\n");
  if (!fixed || keys < 3) return;
  const auto list = [&](std::string_view attribute) -> SceneText& {
    return scene.text("\tsetAttr -s ")
        .integer(keys)
        .text(" \".")
        .text(attribute)
        .text("[1:")
        .integer(keys - 1)
        .text("]\" ");
  };
  list("kit");
  for (int k = 1; k < keys; ++k) scene.text(k % 3 == 0 ? " 1" : " 18");
  scene.text(";\n");
  for (const std::string_view end : kEnds) {
    list(end);
    for (int k = 1; k < keys; ++k) scene.text(" ").real(scene.number(1), 17);
    scene.text(";\n");
  }
}

}  // namespace bench
