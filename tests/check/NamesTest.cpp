// Names that are one for the importer, or none.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "tests/check/CheckedText.h"

namespace check_test {
namespace {

using diag::Code;
using testing::HasSubstr;

TEST(NamesTest, TwoNodesOfOneName) {
  const Checked checked(
      CameraScene("") +
      "createNode transform -n \"rig\";\ncreateNode transform -n \"shotCam\" -p \"rig\";\n");
  EXPECT_EQ(checked.MarkedBy(Code::SameNames), "shotCam");
  EXPECT_EQ(checked.LineOf(Code::SameNames), 13u);
}

TEST(NamesTest, AParentThatIsNotInTheFileIsNotANodeWithoutAName) {
  const Checked checked(CameraScene("") + "createNode camera -n \"otherShape\" -p \"nosuch\";\n");
  EXPECT_EQ(checked.CountOf(Code::ParentElsewhere), 1u);
  EXPECT_EQ(checked.CountOf(Code::NodeWithoutName), 0u);
}

TEST(NamesTest, NamesThatDifferInCase) {
  const Checked checked(CameraScene("") + "createNode transform -n \"SHOTCAM\";\n");
  EXPECT_EQ(checked.SentenceOf(Code::NamesDifferInCase),
            "\"shotCam\" and \"SHOTCAM\" are one name for the importer");
}

TEST(NamesTest, NodesOfOneNameInDifferentListsAreApart) {
  const Checked checked(CameraScene("") + "createNode locator -n \"shotCam\";\n");
  EXPECT_EQ(checked.CountOf(Code::SameNames), 0u);
}

TEST(NamesTest, NamesThatNoCameraDependsOnDoNotCount) {
  const Checked checked(CameraScene("") +
                        "createNode transform -n \"a\";\ncreateNode transform -n \"b\";\n"
                        "createNode transform -n \"c\" -p \"a\";\ncreateNode transform -n \"c\" -p \"b\";\n");
  EXPECT_EQ(checked.CountOf(Code::SameNames), 0u);
}

TEST(NamesTest, ANodeThatHasTheNameOfAParentThatDoesNotComeOver) {
  const Checked checked(
      kHead +
      "createNode joint -n \"rig\";\ncreateNode transform -n \"shotCam\" -p \"rig\";\n"
      "createNode camera -n \"shotCamShape\" -p \"shotCam\";\n"
      "createNode transform -n \"group\";\ncreateNode transform -n \"rig\" -p \"group\";\n");
  ASSERT_EQ(checked.cameOver().layers.size(), 3u);  // the camera came over under the other node
  EXPECT_EQ(checked.MarkedBy(Code::SameNames), "rig");
  EXPECT_EQ(checked.LineOf(Code::SameNames), 7u);
}

TEST(NamesTest, ANameThatIsTooLong) {
  const std::string scene = CameraScene("");
  EXPECT_EQ(Checked(scene + "createNode transform -n \"" + std::string(252, 'a') + "\";\n")
                .CountOf(Code::NameTooLong),
            0u);
  const Checked checked(scene + "createNode transform -n \"" + std::string(253, 'a') + "\";\n");
  EXPECT_THAT(checked.SentenceOf(Code::NameTooLong), HasSubstr("253 bytes"));
}

TEST(NamesTest, ANodeWithoutANameInQuotes) {
  const Checked checked(CameraScene("") + "createNode transform -n rig;\ncreateNode mesh;\n");
  EXPECT_EQ(checked.CountOf(Code::NodeWithoutName), 1u);
}

TEST(NamesTest, TextAfterAZeroByte) {
  const std::string zero(1, '\0');
  const Checked checked(CameraScene("") + zero + "\ncreateNode transform -n \"a\";\n");
  EXPECT_THAT(checked.SentenceOf(Code::TextAfterNul), HasSubstr("30 bytes"));
  EXPECT_EQ(checked.CountOf(Code::UnexpectedByte), 0u);
  EXPECT_EQ(Checked(CameraScene("") + zero + zero + " \n").All(), "");
}

TEST(NamesTest, ParentsInACircleAndASecondUnitAreSaidByTheReader) {
  const Checked checked(CameraScene("") +
                        "currentUnit -l meter;\n"
                        "createNode transform -n \"a\" -p \"b\";\ncreateNode transform -n \"b\" -p \"a\";\n");
  EXPECT_EQ(checked.CountOf(Code::SecondUnit), 1u);
  EXPECT_EQ(checked.CountOf(Code::ParentCircle), 1u);
}

}  // namespace
}  // namespace check_test
