#include "maya/NodeChannels.h"

#include "hostapi/ErrorCodes.h"
#include "hostutil/HostSetup.h"
#include "tests/support/ReaderFixture.h"

using namespace mayaimport;

namespace testsupport {
namespace {

using ::testing::ElementsAre;

constexpr HostError kRehearsedCode = 7211;

constexpr const char* kPlugs[] = {"n.tx", "n.ty", "n.tz", "n.rx", "n.ry", "n.rz", "n.sx", "n.sy", "n.sz"};

template <typename Work>
HostError CodeOf(Work&& work) {
  try {
    work();
    return 0;
  } catch (int code) {
    return code;
  }
}

class NodeChannelsTest : public ReaderTest {
 protected:
  // A node "n" with a curve of so many keys on each channel in their order, -1 for no curve. Key k of channel
  // c is at the time 100 c + k and has the value 1000 c + k.
  void Use(const std::vector<int>& keyCounts) {
    std::string text = "createNode transform -n \"n\";\n";
    for (std::size_t channel = 0; channel < keyCounts.size(); ++channel) {
      if (keyCounts[channel] < 0) continue;
      const std::string curve = "c" + std::to_string(channel);
      text += "createNode animCurveTL -n \"" + curve + "\";\n";
      if (keyCounts[channel] > 0) text += "setAttr \".ktv\"";
      for (int key = 0; key < keyCounts[channel]; ++key) {
        text += " " + std::to_string(100 * channel + static_cast<std::size_t>(key)) + " " +
                std::to_string(1000 * channel + static_cast<std::size_t>(key));
      }
      if (keyCounts[channel] > 0) text += ";\n";
      text += "connectAttr \"" + curve + ".o\" \"" + kPlugs[channel] + "\";\n";
    }
    ASSERT_EQ(Read(text), 0);
    node_ = TransformAt(0);
  }

  // All channels, whatever their key counts.
  NodeChannels Taken() {
    NodeChannels channels;
    for (int slot = 0; slot < kChannelCount; ++slot) channels.TakeNext(scene().curves, node_);
    return channels;
  }

  // The values of sample n of all groups; -1 where none is written.
  std::vector<double> Sample(const NodeChannels& channels, std::int32_t n) {
    std::vector<double> sample;
    for (const std::int32_t group : {kTranslateGroup, kRotateGroup, kScaleGroup}) {
      double values[kAxisCount] = {-1, -1, -1};
      EXPECT_TRUE(channels.Extract(node_, group, n, values)) << group << ' ' << n;
      sample.insert(sample.end(), std::begin(values), std::end(values));
    }
    return sample;
  }

  // Whether sample n can be read, time and values alike; what is not read stays.
  bool IsAtHand(const NodeChannels& channels, const MAYA_Transform& node, std::int32_t n) {
    const bool atHand = channels.FindTime(node, n) != nullptr;
    for (const std::int32_t group : {kTranslateGroup, kRotateGroup, kScaleGroup}) {
      double values[kAxisCount] = {-1, -1, -1};
      EXPECT_EQ(channels.Extract(node, group, n, values), atHand) << group << ' ' << n;
      if (!atHand) {
        EXPECT_THAT(values, ElementsAre(-1, -1, -1)) << group << ' ' << n;
      }
    }
    return atHand;
  }

  MAYA_Transform node_{};
};

TEST_F(NodeChannelsTest, OfANodeWithoutCurvesThereIsNothingToFetch) {
  NodeChannels channels;
  EXPECT_TRUE(channels.AreOf(DefaultTransform()));
  channels.FetchRuns();
  EXPECT_EQ(channels.sharedCount(), 0);
  EXPECT_FALSE(IsAtHand(channels, DefaultTransform(), 0));
}

TEST_F(NodeChannelsTest, EachSlotGivesTheKeysOfItsCurveAndOneKeyStandsForEverySample) {
  Use({2, 1, 2, 2, 0, 2, -1, 1, 2});
  NodeChannels channels = Taken();
  channels.FetchRuns();
  EXPECT_EQ(channels.sharedCount(), 2);
  EXPECT_THAT(Sample(channels, 0), ElementsAre(0, 1000, 2000, 3000, -1, 5000, -1, 7000, 8000));
  EXPECT_THAT(Sample(channels, 1), ElementsAre(1, 1000, 2001, 3001, -1, 5001, -1, 7000, 8001));
}

TEST_F(NodeChannelsTest, TheFirstChannelWithAKeyOfThatNumberGivesTheTime) {
  Use({0, -1, 1, 1, 3, 3});
  NodeChannels channels = Taken();
  channels.FetchRuns();
  std::vector<double> times;
  for (const std::int32_t n : {0, 1, 2}) times.push_back(channels.FindTime(node_, n)->time);
  EXPECT_THAT(times, ElementsAre(200, 401, 402));
}

TEST_F(NodeChannelsTest, SamplesThatAreNotThereAreNotAtHand) {
  Use({3, 1});
  NodeChannels channels = Taken();
  channels.FetchRuns();
  EXPECT_TRUE(IsAtHand(channels, node_, 2));
  for (const std::int32_t n : {3, 4, -1, INT32_MAX, INT32_MIN}) {
    EXPECT_FALSE(IsAtHand(channels, node_, n)) << n;
  }
}

TEST_F(NodeChannelsTest, OfConstantsAloneNothingIsAtHand) {
  Use({1, 1, 0});
  NodeChannels channels = Taken();
  channels.FetchRuns();
  EXPECT_EQ(channels.sharedCount(), 0);
  EXPECT_FALSE(IsAtHand(channels, node_, 0));
}

TEST_F(NodeChannelsTest, AnotherRecordWithTheSameNineCurvesIsTheSameNode) {
  Use({2, 1, 2, 2, 2, 2, 2, 2, 2});
  NodeChannels channels = Taken();
  channels.FetchRuns();
  MAYA_Transform other = DefaultTransform();
  std::copy(std::begin(node_.curve), std::begin(node_.curve) + kChannelCount, std::begin(other.curve));
  other.curve[kTargetSlot] = 5;
  EXPECT_TRUE(channels.AreOf(other));
  EXPECT_TRUE(IsAtHand(channels, other, 1));
}

TEST_F(NodeChannelsTest, ANodeWithAnotherCurveInAnySlotIsAnotherNode) {
  Use({2, 1, 2, 2, 2, 2, 2, 2, 2});
  NodeChannels channels = Taken();
  channels.FetchRuns();
  for (int slot = 0; slot < kChannelCount; ++slot) {
    const std::int32_t curve = std::exchange(node_.curve[slot], kNoIndex);
    EXPECT_FALSE(channels.AreOf(node_)) << slot;
    EXPECT_FALSE(IsAtHand(channels, node_, 1)) << slot;
    node_.curve[slot] = curve;
  }
  EXPECT_TRUE(IsAtHand(channels, node_, 1));
}

TEST_F(NodeChannelsTest, EveryAnimatedChannelThatDiffersFromTheFirstIsReported) {
  Use({1, 3, 0, 3, 4, 3, -1, 1, 2});
  NodeChannels channels;
  const bool agrees[] = {true, true, true, true, false, true, true, true, false};
  for (const bool expected : agrees) EXPECT_EQ(channels.TakeNext(scene().curves, node_), expected);
  EXPECT_EQ(channels.sharedCount(), 3);
}

TEST_F(NodeChannelsTest, ACurveThatIsNotThereIsTheListsCode) {
  Use({2, 2});
  NodeChannels channels;
  ASSERT_TRUE(channels.TakeNext(scene().curves, node_));
  node_.curve[1] = 4711;
  EXPECT_EQ(CodeOf([&] { channels.TakeNext(scene().curves, node_); }), HOST_ERR_LIST_INDEX);
}

TEST_F(NodeChannelsTest, RunsAreFetchedWithOneCallForEachChannelThatHasKeysAndOnlyOnce) {
  Use({3, 1, 0, -1, 3});
  NodeChannels channels = Taken();
  const UtilityRehearsal counting;
  channels.FetchRuns();
  channels.FetchRuns();
  EXPECT_THAT(Sample(channels, 2), ElementsAre(2, 1000, -1, -1, 4002, -1, -1, -1, -1));
  EXPECT_EQ(HostUtilityCallCount(HOST_UTILITY_ListGet), 3);
}

TEST_F(NodeChannelsTest, WhereARunFailsNothingIsAtHandUntilAllAreFetched) {
  Use({3, 3, 3});
  for (const std::int64_t nth : {1, 2, 3}) {
    NodeChannels channels = Taken();
    {
      const UtilityRehearsal failing(HOST_UTILITY_ListGet, nth, kRehearsedCode);
      EXPECT_EQ(CodeOf([&] { channels.FetchRuns(); }), kRehearsedCode);
    }
    EXPECT_FALSE(IsAtHand(channels, node_, 0));
    {
      const UtilityRehearsal nothing(HOST_UTILITY_ListGet, nth, 0);
      EXPECT_EQ(CodeOf([&] { channels.FetchRuns(); }), 0);
    }
    EXPECT_FALSE(IsAtHand(channels, node_, 0));
    channels.FetchRuns();
    EXPECT_TRUE(IsAtHand(channels, node_, 0));
  }
}

}  // namespace
}  // namespace testsupport
