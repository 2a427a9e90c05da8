// The look-ats in the head, and the cameras that the import aims by them.
#include "check/HeadInternal.h"
#include "check/LookAts.h"

namespace check {

void DescribeLookAts(const HeadSource& source, Head* head) {
  const scene::Scene& scene = source.scene;
  for (const LookAt& one : FindLookAts(scene, source.cameras)) {
    AddOrCount(source, &head->lookAts, &head->lookAtsNotShown, [&] {
      const scene::Node& node = scene.node(one.node);
      LookAtHead lookAt{std::string(node.name), WhereIs(node.place, source.lines), {}, {}, {}};
      if (one.turned != scene::kNoNode) lookAt.turns = scene.node(one.turned).name;
      if (one.target == scene::kNoNode) return lookAt;
      lookAt.camera = scene.node(one.camera->shape).name;
      lookAt.target = scene.node(one.target).name;
      return lookAt;
    });
  }
}

}  // namespace check
