#include "tests/secondreader/FailureScenes.h"

#include "tests/support/BuilderScene.h"

namespace testsupport {
namespace {

std::string Head() { return SceneHead() + RenderSize(640, 480); }

std::string Rig(const std::string& parent = "") {
  return TransformText("rig", parent) + Triple(".t", 1, 2, 3) + Triple(".r", 10, 20, 30);
}

std::string Lens() { return CameraText("lens", "rig"); }

std::string Focal() { return Animation("lens.fl", {{3, 35}, {4, 50}}); }

std::vector<FailureScene> MakeScenes() {
  return {
      {"Static", Head() + Rig() + Lens()},
      {"TwoCameras", Head() + Rig() + Lens() + CameraText("second", "nobody")},
      {"AnimatedTransform", Head() + Rig() + Lens() + Animation("rig.tx", {{1, 0}, {2, 5}, {3, 7}})},
      {"ParentChain", Head() + TransformText("world") + TransformText("arm", "world") + Rig("arm") + Lens() +
                          Animation("arm.ry", {{1, 0}, {2, 90}})},
      {"MarkedLocator", Head() + CameraText("lens", "") + TransformText("set") +
                            TransformText("mark", "set") + LocatorText("null1", "mark") +
                            Animation("mark.ty", {{1, 0}, {2, 5}})},
      {"PixelsThatAreNotSquare", SceneHead() + RenderSize(720, 486, 0.9) + Rig() + Lens()},
      {"AnimatedFocalLength", Head() + Rig() + Lens() + Focal() + Animation("rig.tz", {{1, 0}, {2, 5}})},
      {"ZoomThatHasKeys",
       SceneHead("-t sec") + RenderSize(640, 480) + Rig() + Lens() + Focal() +
           Animation("rig.tz", {{1, 0}, {2, 5}}),
       2},
      {"AimAtAnAnimatedTarget", Head() + Rig() + Lens() + TransformText("target") + ConstraintText("aim") +
                                    Aim("aim", "rig", "target") + Animation("target.tx", {{1, 0}, {2, 5}})},
      {"DifferentKeyCounts", Head() + Rig() + Lens() + Animation("rig.tx", {{1, 0}, {2, 5}}) +
                                 Animation("rig.ty", {{1, 0}, {2, 5}, {3, 6}})},
      {"BrokenText", Head() + Rig() + Lens() + "setAttr _underscore 1;\n"},
      {"TextThatEndsTooSoon", Head() + Rig() + Lens() + "createNode transform -n \"half"},
      {"NoMayaFile", "This is a letter and not a scene.\n"},
  };
}

}  // namespace

const std::vector<FailureScene>& FailureScenes() {
  static const std::vector<FailureScene> scenes = MakeScenes();
  return scenes;
}

}  // namespace testsupport
