#include <cmath>

#include "plugin/Globals.h"
#include "tests/support/BuilderFixture.h"
#include "tests/support/BuilderRun.h"
#include "tests/support/BuilderScene.h"

using namespace mayaimport;

namespace testsupport {
namespace {

using ::testing::DoubleNear;
using ::testing::ElementsAre;
using ::testing::Pointwise;

constexpr double kNear = 1e-9;
constexpr int kStreams[] = {kScale, kXRotation, kYRotation, kZRotation, kPosition};

class TransformAnimationTest : public BuilderTest {
 protected:
  void Use(const std::string& scene, std::string_view units = "-t film") {
    Begin(SceneHead(units) + TransformText("n") + scene);
    node_ = TransformAt(0);
  }

  void Apply() { parser().ApplyTransformAnimation(NewNull(), &node_); }

  void ExpectValues(int id, const std::vector<double>& expected, std::size_t component = 0) {
    EXPECT_THAT(KeyValues(id, component), Pointwise(DoubleNear(kNear), expected)) << "stream " << id;
  }

  std::vector<std::string> Fields(const char* call, const char* key) {
    std::vector<std::string> values;
    for (const std::string& line : CallsOf(trace_, call)) values.emplace_back(Field(line, key));
    return values;
  }

  MAYA_Transform node_{};
  std::vector<std::string> trace_;
};

TEST_F(TransformAnimationTest, AnUnanimatedNodeMakesNoCallAtAll) {
  Use(Triple(".t", 1, 2, 3));
  Apply();
  EXPECT_TRUE(TakeTrace().empty());
}

TEST_F(TransformAnimationTest, ACurveOfOneKeyAnimatesNothing) {
  Use(Animation("n.tx", {{1, 5}}));
  Apply();
  EXPECT_TRUE(TakeTrace().empty());
}

TEST_F(TransformAnimationTest, OneAnimatedChannelKeysAllFiveStreams) {
  Use(Triple(".t", 1, 2, 3) + Triple(".r", 10, 20, 30) + Triple(".s", 2, 3, 4) +
      Animation("n.tx", KeysFrom(5, {0, 1, 2, 3, 4, 5, 6, 7, 8, 9})));
  Apply();
  ExpectValues(kPosition, {0, 1, 2, 3, 4, 5, 6, 7, 8, 9});
  ExpectValues(kPosition, std::vector<double>(10, -2.0), 1);
  ExpectValues(kPosition, std::vector<double>(10, -3.0), 2);
  ExpectValues(kScale, std::vector<double>(10, 200.0), 0);
  ExpectValues(kScale, std::vector<double>(10, 300.0), 1);
  ExpectValues(kScale, std::vector<double>(10, 400.0), 2);
  ExpectValues(kXRotation, std::vector<double>(10, 10.0));
  ExpectValues(kYRotation, std::vector<double>(10, -20.0));
  ExpectValues(kZRotation, std::vector<double>(10, -30.0));
  for (const int id : kStreams) {
    const std::vector<T_Time> times = KeyTimes(id);
    ASSERT_EQ(times.size(), 10u);
    for (std::int32_t n = 0; n < 10; ++n)
      EXPECT_EQ(times[static_cast<std::size_t>(n)], (T_Time{n * 1000, 24000}));
  }
}

TEST_F(TransformAnimationTest, AChannelOfOneKeyGivesThatToEveryKeyOfTheNode) {
  Use(Triple(".t", 1, 2, 3) + Triple(".r", 10, 20, 30) + Triple(".s", 2, 3, 4) +
      Animation("n.tx", KeysFrom(5, {0, 1, 2})) + Animation("n.ty", {{5, 44}}) +
      Animation("n.ry", {{5, 25}}) + Animation("n.sz", {{5, 6}}));
  Apply();
  ExpectValues(kPosition, {0, 1, 2});
  ExpectValues(kPosition, {-44, -44, -44}, 1);
  ExpectValues(kPosition, {-3, -3, -3}, 2);
  ExpectValues(kXRotation, {10, 10, 10});
  ExpectValues(kYRotation, {-25, -25, -25});
  ExpectValues(kZRotation, {-30, -30, -30});
  ExpectValues(kScale, {200, 200, 200}, 0);
  ExpectValues(kScale, {300, 300, 300}, 1);
  ExpectValues(kScale, {600, 600, 600}, 2);
}

TEST_F(TransformAnimationTest, BatchesAreOpenedFilledAndClosedInTheOrderScaleXYZPosition) {
  Use(Animation("n.tx", KeysFrom(1, {1, 2})));
  Apply();
  trace_ = TakeTrace();
  EXPECT_THAT(Fields("AcquireLayerStream", "streamId"),
              ElementsAre("2", "8", "9", "3", "1", "2", "8", "9", "3", "1", "2", "8", "9", "3", "1"));
  EXPECT_THAT(Fields("AddBatchKeyframe", "batch"),
              ElementsAre("\"batch:1\"", "\"batch:2\"", "\"batch:3\"", "\"batch:4\"", "\"batch:5\"",
                          "\"batch:1\"", "\"batch:2\"", "\"batch:3\"", "\"batch:4\"", "\"batch:5\""));
  EXPECT_THAT(Fields("EndKeyframeBatch", "batch"),
              ElementsAre("\"batch:1\"", "\"batch:2\"", "\"batch:3\"", "\"batch:4\"", "\"batch:5\""));
  EXPECT_THAT(Fields("EndKeyframeBatch", "commit"), ElementsAre("1", "1", "1", "1", "1"));
}

TEST_F(TransformAnimationTest, AKeyAtTheStaticValuesIsTheStaticTransform) {
  const std::string pose = Triple(".t", 3, -4, 5) + Triple(".r", 25, -35, 145) + Triple(".s", -2, 0.5, 3) +
                           Triple(".rp", 1, 2, 3) + Triple(".sp", -4, 5, -6);
  Use(pose + Animation("n.tx", KeysFrom(1, {3, 3})));
  VOR_Layer* const layer = NewNull();
  parser().SetTransform(layer, &node_);
  parser().ApplyTransformAnimation(layer, &node_);
  for (const int id : kStreams) {
    const refhost::Stream& stream = StreamOf(id);
    ASSERT_EQ(stream.keyCount(), 2u);
    for (std::size_t i = 0; i < static_cast<std::size_t>(stream.dimension); ++i) {
      EXPECT_EQ(stream.keys->values[i], stream.value[i]) << "stream " << id;
    }
  }
}

TEST_F(TransformAnimationTest, EveryChannelReachesItsStream) {
  Use(Animation("n.tx", KeysFrom(1, {1, 2})) + Animation("n.ty", KeysFrom(1, {3, 4})) +
      Animation("n.tz", KeysFrom(1, {5, 6})) + Animation("n.rx", KeysFrom(1, {10, 11})) +
      Animation("n.ry", KeysFrom(1, {20, 21})) + Animation("n.rz", KeysFrom(1, {30, 31})) +
      Animation("n.sx", KeysFrom(1, {2, 2.5})) + Animation("n.sy", KeysFrom(1, {3, 3.5})) +
      Animation("n.sz", KeysFrom(1, {4, 4.5})));
  Apply();
  ExpectValues(kPosition, {1, 2}, 0);
  ExpectValues(kPosition, {-3, -4}, 1);
  ExpectValues(kPosition, {-5, -6}, 2);
  ExpectValues(kXRotation, {10, 11});
  ExpectValues(kYRotation, {-20, -21});
  ExpectValues(kZRotation, {-30, -31});
  ExpectValues(kScale, {200, 250}, 0);
  ExpectValues(kScale, {300, 350}, 1);
  ExpectValues(kScale, {400, 450}, 2);
}

TEST_F(TransformAnimationTest, ATurnThroughTheSeamKeepsRunningOn) {
  Use(Animation("n.rz", KeysFrom(1, {-170, -190, -350, -370, -530})));
  Apply();
  ExpectValues(kZRotation, {170, 190, 350, 370, 530});
}

TEST_F(TransformAnimationTest, KeyZeroKeepsItsAngleAsItIsTakenApart) {
  Use(Animation("n.rx", KeysFrom(1, {720, 725})));
  Apply();
  ExpectValues(kXRotation, {0, 5});
}

TEST_F(TransformAnimationTest, EachAngleIsComparedWithTheOneBeforeAfterItsOwnShift) {
  std::vector<double> angles;
  for (int i = 0; i < 60; ++i) angles.push_back(100.0 * i);
  Use(Animation("n.rx", KeysFrom(1, angles)));
  Apply();
  EXPECT_THAT(KeyValues(kXRotation), Pointwise(DoubleNear(1e-7), angles));
}

TEST_F(TransformAnimationTest, AScaleThatIsNotUniformEntersBeforeTheTurn) {
  Use(Triple(".s", 1, 2, 1) + Animation("n.rz", KeysFrom(1, {0, 90})));
  Apply();
  ExpectValues(kScale, {100, 100}, 0);
  ExpectValues(kScale, {200, 200}, 1);
  ExpectValues(kZRotation, {0, -90});
}

TEST_F(TransformAnimationTest, AMirroredScaleComesOutAsANegativeXAndATurn) {
  Use(Triple(".s", 1, -2, 3) + Animation("n.tx", KeysFrom(1, {0, 1})));
  Apply();
  // Mirroring y is mirroring x and half a turn about z.
  ExpectValues(kScale, {-100, -100}, 0);
  ExpectValues(kScale, {200, 200}, 1);
  ExpectValues(kScale, {300, 300}, 2);
  for (const double angle : KeyValues(kZRotation)) EXPECT_NEAR(std::fabs(angle), 180.0, kNear);
}

TEST_F(TransformAnimationTest, PivotsAreStaticAndFoldIntoThePosition) {
  Use(Triple(".rp", 0, 1, 0) + Animation("n.rz", KeysFrom(1, {0, 90})));
  Apply();
  ExpectValues(kPosition, {0, 1}, 0);
  ExpectValues(kPosition, {0, -1}, 1);
  EXPECT_EQ(StreamOf(kAnchor).keyCount(), 0u);
}

TEST_F(TransformAnimationTest, WithThePreferenceOffDistancesStayAndScalesAreStillPercent) {
  Use(Triple(".t", 0, 2, 0) + Animation("n.tx", KeysFrom(1, {1.5, 2.5})) +
          Animation("n.sx", KeysFrom(1, {0.5, 3})),
      "-l m -t film");
  Apply();
  ExpectValues(kPosition, {1.5, 2.5}, 0);
  ExpectValues(kPosition, {-2, -2}, 1);
  ExpectValues(kScale, {50, 300}, 0);
}

TEST_F(TransformAnimationTest, WithThePreferenceOnTranslationsAndPivotsAreConverted) {
  G_use_linear_unitsL = 1;
  Use(Triple(".sp", 1, 0, 0) + Animation("n.tx", KeysFrom(1, {1, 2})) +
          Animation("n.sx", KeysFrom(1, {1, 3})),
      "-l in -t film");
  Apply();
  ExpectValues(kPosition, {72, 144 - 144}, 0);
  ExpectValues(kScale, {100, 300}, 0);
}

TEST_F(TransformAnimationTest, RadianKeysAreScaledDownTwice) {
  Use(Animation("n.rx", KeysFrom(1, {1, 2})), "-a rad -t film");
  Apply();
  ExpectValues(kXRotation, {0.017453292519943295, 2 * 0.017453292519943295});
}

TEST_F(TransformAnimationTest, DifferentCountsAreThrownBeforeABatchIsOpened) {
  Use(Animation("n.tx", KeysFrom(1, {1, 2})) + Animation("n.ty", KeysFrom(1, {1, 2, 3})));
  EXPECT_EQ(CodeOf([&] { Apply(); }), 1289987);
  EXPECT_TRUE(CallsOf(TakeTrace(), "BeginKeyframeBatch").empty());
}

}  // namespace
}  // namespace testsupport
