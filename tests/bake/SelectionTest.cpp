#include "bake/Selection.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <string_view>
#include <vector>

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

constexpr std::string_view kScene =
    "createNode transform -s -n \"persp\";\n"
    "createNode camera -s -n \"perspShape\" -p \"persp\";\n"
    "createNode transform -n \"rig\";\n"
    "createNode transform -n \"left\" -p \"rig\";\n"
    "createNode camera -n \"leftShape\" -p \"left\";\n"
    "createNode transform -n \"plan\";\n"
    "createNode camera -n \"planShape\" -p \"plan\";\n"
    "\tsetAttr \".o\" yes;\n"
    "createNode transform -n \"right\";\n"
    "createNode stereoRigCamera -n \"rightShape\" -p \"right\";\n"
    "createNode transform -n \"persp1\";\n"
    "createNode camera -n \"perspShape\" -p \"persp1\";\n"
    "createNode locator -n \"nullShape\" -p \"right\";\n"
    "createNode locator -n \"aNULL\" -p \"right\";\n"
    "createNode locator -n \"locatorShape1\" -p \"right\";\n"
    "createNode locator -n \"nULL\" -p \"right\";\n";

class SelectionTest : public testing::Test {
 protected:
  std::vector<std::string> Paths(const std::vector<scene::NodeId>& nodes) const {
    std::vector<std::string> paths;
    for (const scene::NodeId node : nodes) paths.push_back(scene_.PathOf(node));
    return paths;
  }
  std::vector<std::string> Cameras(const std::vector<std::string>& names) {
    bake::Options options;
    options.cameras = names;
    return Paths(bake::Select(scene_, options, &diagnostics_).cameras);
  }

  diag::Collector diagnostics_{kScene};
  scene::Scene scene_ = scene::Read(kScene, diagnostics_);
};

TEST_F(SelectionTest, CamerasThatSomebodySetUpAreTakenInTheOrderOfTheFile) {
  EXPECT_THAT(Cameras({}), ElementsAre("|rig|left|leftShape", "|right|rightShape", "|persp1|perspShape"));
}

TEST_F(SelectionTest, ACameraIsMeantByItsNameItsTransformsNameOrTheirPaths) {
  for (const char* name : {"leftShape", "left", "|rig|left", "|rig|left|leftShape"}) {
    EXPECT_THAT(Cameras({name}), ElementsAre("|rig|left|leftShape")) << name;
  }
  EXPECT_EQ(diagnostics_.CountOf(diag::Code::CameraNotFound), 0u);
}

TEST_F(SelectionTest, ANameThatFitsNoCameraIsAnErrorEach) {
  for (const char* name : {"Left", "lef", "plan", "persp", "|left", "rig"}) {
    EXPECT_THAT(Cameras({name}), IsEmpty()) << name;
  }
  EXPECT_EQ(diagnostics_.CountOf(diag::Code::CameraNotFound), 6u);
}

TEST_F(SelectionTest, TheCamerasThatAreFoundAreTakenBesideOneThatIsNot) {
  EXPECT_THAT(Cameras({"nobody", "right"}), ElementsAre("|right|rightShape"));
  EXPECT_EQ(diagnostics_.CountOf(diag::Code::CameraNotFound), 1u);
}

TEST_F(SelectionTest, LocatorsAreTakenByTheirMarksAllOrNotAtAll) {
  bake::Options options;
  bake::Selection marked = bake::Select(scene_, options, &diagnostics_);
  EXPECT_THAT(Paths(marked.locators), ElementsAre("|right|nullShape", "|right|aNULL"));
  EXPECT_EQ(marked.locatorsLeftOut, 2u);
  options.locators = bake::Locators::kAll;
  const bake::Selection all = bake::Select(scene_, options, &diagnostics_);
  EXPECT_EQ(all.locators.size(), 4u);
  EXPECT_EQ(all.locatorsLeftOut, 0u);
  options.locators = bake::Locators::kNone;
  EXPECT_THAT(bake::Select(scene_, options, &diagnostics_).locators, IsEmpty());
}

}  // namespace
