// What grows with a scene, counted in calls of the host's lists and suites instead of seconds.
#include <gtest/gtest.h>

#include <cstdint>
#include <string>

#include "tests/support/BuilderRun.h"
#include "tests/support/BuilderScene.h"

namespace testsupport {
namespace {

std::int64_t ListCalls(const refhost::Host& host) {
  std::int64_t calls = 0;
  for (const char* const service :
       {"ListCreate", "ListAppend", "ListGet", "ListLock", "ListUnlock", "ListCount"}) {
    calls += host.callCount(service);
  }
  return calls;
}

struct Cost {
  std::int64_t lists = 0;
  std::int64_t suites = 0;
};

Cost CostOf(const std::string& scene) {
  const TemporaryFile file(scene);
  const ImportRun run = ImportUntraced(file);
  EXPECT_EQ(run.result.code, 0);
  EXPECT_TRUE(run.result.ledgerClean());
  return {ListCalls(*run.host), run.result.suiteCalls};
}

// Linear is: four times as much costs at most four times as many calls, and a little for what is there once.
template <typename MakeScene>
void ExpectLinear(MakeScene makeScene, int size) {
  constexpr std::int64_t kOnce = 200;
  const Cost small = CostOf(makeScene(size));
  const Cost large = CostOf(makeScene(4 * size));
  EXPECT_LE(large.lists, 4 * small.lists + kOnce) << "of " << small.lists;
  EXPECT_LE(large.suites, 4 * small.suites + kOnce) << "of " << small.suites;
  EXPECT_GT(small.lists + small.suites, size);  // the scene is not passed over
}

std::string Number(int value) { return std::to_string(value); }

std::string ManyTransforms(int count) {
  std::string scene;
  for (int i = 0; i < count; ++i) scene += TransformText("n" + Number(i));
  return scene;
}

TEST(GrowthTest, CamerasAmongManyConstraintsCostNoPairs) {
  ExpectLinear(
      [](int count) {
        std::string scene = SceneHead() + RenderSize(640, 480) + TransformText("target");
        for (int i = 0; i < count; ++i) {
          const std::string n = Number(i);
          scene += TransformText("rig" + n) + CameraText("lens" + n, "rig" + n) + ConstraintText("aim" + n) +
                   Aim("aim" + n, "rig" + n, "target");
        }
        return scene;
      },
      100);
}

TEST(GrowthTest, ConstraintsOfOtherTransformsAreNotWalkedForEveryCamera) {
  ExpectLinear(
      [](int count) {
        std::string scene =
            SceneHead() + RenderSize(640, 480) + TransformText("target") + TransformText("prop");
        for (int i = 0; i < count; ++i) {
          const std::string n = Number(i);
          scene += ConstraintText("aim" + n) + Aim("aim" + n, "prop", "target") +
                   CameraText("lens" + n, "rig" + n);
        }
        for (int i = 0; i < count; ++i) scene += TransformText("rig" + Number(i));
        return scene;
      },
      100);
}

TEST(GrowthTest, AParentChainCostsOneLookAtEachOfItsTransforms) {
  ExpectLinear(
      [](int count) {
        std::string scene = SceneHead() + RenderSize(640, 480) + TransformText("n0");
        for (int i = 1; i < count; ++i) scene += TransformText("n" + Number(i), "n" + Number(i - 1));
        return scene + CameraText("lens", "n" + Number(count - 1));
      },
      1000);
}

TEST(GrowthTest, CamerasAndLocatorsFindTheirTransformsWithoutAWalk) {
  ExpectLinear(
      [](int count) {
        std::string scene = SceneHead() + RenderSize(640, 480) + ManyTransforms(count);
        for (int i = 0; i < count; ++i) {
          scene += CameraText("lens" + Number(i), "n" + Number(i)) +
                   LocatorText("null" + Number(i), "n" + Number(i));
        }
        return scene;
      },
      200);
}

TEST(GrowthTest, KeysCostTheSameEach) {
  ExpectLinear(
      [](int count) {
        SceneKeys keys;
        for (int i = 0; i < count; ++i) keys.emplace_back(i, 7.0 * i);
        return SceneHead() + RenderSize(640, 480) + TransformText("rig") + CameraText("lens", "rig") +
               Animation("rig.tx", keys) + Animation("rig.ry", keys) + Animation("lens.fl", keys);
      },
      500);
}

TEST(GrowthTest, SpinningKeysCostTheSameHoweverManyTurnsLieAfterThem) {
  ExpectLinear(
      [](int count) {
        SceneKeys keys;
        for (int i = 0; i < count; ++i) keys.emplace_back(i, 170.0 * i);
        return SceneHead() + RenderSize(640, 480) + TransformText("rig") + CameraText("lens", "rig") +
               Animation("rig.rx", keys);
      },
      2000);
}

TEST(GrowthTest, ASpinOfAHundredThousandTurnsRunsOn) {
  constexpr int kTurns = 100000;
  constexpr int kKeysPerTurn = 3;
  constexpr double kStep = 360.0 / kKeysPerTurn;
  constexpr int kZRotation = 3;
  SceneKeys keys;
  for (int i = 0; i <= kTurns * kKeysPerTurn; ++i) keys.emplace_back(i, kStep * i);
  const TemporaryFile file(SceneHead() + RenderSize(640, 480) + TransformText("rig") +
                           CameraText("lens", "rig") + Animation("rig.rz", keys));
  const ImportRun run = ImportUntraced(file);
  ASSERT_EQ(run.result.code, 0);
  const refhost::Stream& turn = *FindLayer(*run.host, "lens")->findStream(kZRotation);
  ASSERT_EQ(turn.keyCount(), keys.size());
  // As many additions of a turn as there are turns, each rounded to a double of that size.
  EXPECT_NEAR(turn.keys->values.back(), -360.0 * kTurns, 1e-3);
  EXPECT_LE(ListCalls(*run.host), 4 * static_cast<std::int64_t>(keys.size()));
}

TEST(GrowthTest, TwoHundredThousandNodesStayLinear) {
  constexpr int kNodes = 200000;
  const Cost cost = CostOf(SceneHead() + RenderSize(640, 480) + ManyTransforms(kNodes) +
                           CameraText("lens", "n" + Number(kNodes - 1)));
  constexpr std::int64_t kPerNode = 4;
  EXPECT_LE(cost.lists, kPerNode * kNodes);
  EXPECT_GE(cost.lists, kNodes);
}

}  // namespace
}  // namespace testsupport
