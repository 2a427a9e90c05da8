// Which layer is which camera's, also where names are not clear.
#include "check/Cameras.h"

#include <gtest/gtest.h>

#include <string>

#include "tests/check/CheckedText.h"

namespace check_test {
namespace {

using diag::Code;

std::string CameraNamed(const std::string& name) {
  return "createNode transform -n \"" + name + "\";\ncreateNode camera -n \"" + name + "Shape\" -p \"" +
         name + "\";\n\tsetAttr \".fl\" 24;\n" + kLens;
}

std::size_t CamerasIn(const Checked& checked) {
  std::size_t came = 0;
  for (const check::CameraHead& camera : checked.report().head.cameras) came += camera.cameOver ? 1 : 0;
  return came;
}

TEST(CamerasTest, NamesThatDifferInCaseLoseNoCamera) {
  const Checked checked(kHead + CameraNamed("one") + CameraNamed("ONE") + CameraNamed("other"));
  ASSERT_EQ(checked.cameOver().layers.size(), 3u);
  EXPECT_EQ(checked.cameOver().layers[0].name, "ONEShape");
  EXPECT_EQ(CamerasIn(checked), 3u);
  EXPECT_EQ(checked.CountOf(Code::CameraNotImported), 0u);
  EXPECT_EQ(checked.CountOf(Code::NamesDifferInCase), 2u);  // of the transform and of the camera
}

TEST(CamerasTest, AStartupCameraThatIsCreatedTwiceComesOver) {
  const std::string top =
      "createNode transform -s -n \"top\";\ncreateNode camera -s -n \"topShape\" -p \"top\";\n";
  const std::string again = "createNode camera -s -n \"topShape\" -p \"top\";\n";
  for (const bool last : {false, true}) {
    const std::string shot = CameraNamed("shot");
    const Checked checked(kHead + top + "\tsetAttr \".o\" yes;\n" + (last ? shot + again : again + shot));
    ASSERT_EQ(checked.cameOver().layers.size(), 2u);
    EXPECT_EQ(CamerasIn(checked), 2u);
    EXPECT_EQ(checked.CountOf(Code::CameraNotImported) + checked.CountOf(Code::StartupCameras), 0u);
    EXPECT_EQ(checked.MarkedBy(Code::OrthographicAsPerspective), "topShape");
  }
}

}  // namespace
}  // namespace check_test
