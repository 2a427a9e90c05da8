// The look-ats in the head, and the cameras that the import aims by them.
#include "check/HeadInternal.h"
#include "check/LookAts.h"

namespace check {

void DescribeLookAts(const HeadSource& source, Head* head) {
  const scene::Scene& scene = source.scene;
  for (const LookAt& one : FindLookAts(scene, source.cameras)) {
    AddOrCount(source, &head->lookAts, &head->lookAtsNotShown, [&] {
      const scene::Node& node = scene.node(one.node);
      LookAtHead lookAt{ShownName(node.name), WhereIs(node.place, source.lines), {}, {}, {}};
      if (one.turned != scene::kNoNode) lookAt.turns = ShownName(scene.node(one.turned).name);
      if (one.target == scene::kNoNode) return lookAt;
      lookAt.camera = ShownName(scene.node(one.camera->shape).name);
      lookAt.target = ShownName(scene.node(one.target).name);
      return lookAt;
    });
  }
}

}  // namespace check
