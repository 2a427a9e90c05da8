// How the reader's lists are made, and in which order they go.
#include "maya/ListAccess.h"

#include "tests/support/ReaderFixture.h"
#include "tests/support/UtilityCalls.h"

using namespace mayaimport;

namespace testsupport {
namespace {

using ::testing::ElementsAre;

constexpr std::int64_t kGrowth = 10;  // records

class ListAccessTest : public ReaderTest {
 protected:
  ListAccessTest() { TakeUtilityCalls(); }
};

TEST_F(ListAccessTest, EachListIsMadeOnFirstUseForItsRecordsWithRoomForTenAtATime) {
  EXPECT_EQ(Read("createNode transform;\n"), 0);
  EXPECT_THAT(TakeUtilityCalls().created,
              ElementsAre(CreatedList{std::int64_t{sizeof(MAYA_Transform)}, kGrowth, 0}));
  EXPECT_EQ(Read("createNode camera;\ncreateNode camera;\n"), 0);
  EXPECT_THAT(TakeUtilityCalls().created,
              ElementsAre(CreatedList{std::int64_t{sizeof(MAYA_Camera)}, kGrowth, 0}));
  EXPECT_EQ(Read("createNode locator;\n"), 0);
  EXPECT_THAT(TakeUtilityCalls().created,
              ElementsAre(CreatedList{std::int64_t{sizeof(MAYA_Locator)}, kGrowth, 0}));
  EXPECT_EQ(Read("createNode animCurveTL;\nsetAttr \".ktv\" 1 2 3 4;\n"), 0);
  EXPECT_THAT(TakeUtilityCalls().created,
              ElementsAre(CreatedList{std::int64_t{sizeof(MAYA_AnimCurve)}, kGrowth, 0},
                          CreatedList{std::int64_t{sizeof(MAYA_Key)}, kGrowth, 0}));
}

TEST_F(ListAccessTest, ListsGoInTheOrderCamerasTransformsKeysOfEachCurveCurvesLocators) {
  ASSERT_EQ(Read("createNode locator -n \"l\";\n"
                 "createNode animCurveTL -n \"a\";\nsetAttr \".ktv\" 1 2;\n"
                 "createNode animCurveTA -n \"b\";\n"
                 "createNode animCurveTU -n \"c\";\nsetAttr \".ktv\" 3 4;\n"
                 "createNode transform -n \"t\";\ncreateNode camera -n \"k\";\n"),
            0);
  const std::vector<const RecordList*> expected = {
      scene().cameras, scene().transforms, CurveAt(0).keys, CurveAt(2).keys, scene().curves, scene().locators,
  };
  TakeUtilityCalls();
  EndScene();
  EXPECT_EQ(TakeUtilityCalls().disposed, expected);
}

}  // namespace
}  // namespace testsupport
