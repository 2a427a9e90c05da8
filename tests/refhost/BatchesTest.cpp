#include "refhost/Batches.h"

#include "refhost/Handles.h"
#include "tests/refhost/StandIn.h"

inline bool operator==(const T_Time& a, const T_Time& b) { return a.value == b.value && a.scale == b.scale; }

namespace refhost {
namespace {

using ::testing::ElementsAre;

const Stream& streamOf(StandIn& plugin, std::int32_t id) {
  return *plugin.host().project().layers().back().findStream(id);
}

class Batches : public ::testing::Test {
 protected:
  StandIn plugin;
  VOR_Layer* layer = plugin.makeNull(plugin.makeComp());
  VOR_Stream* rotation = plugin.acquire(layer, HOST_STREAM_ROTATION_Z);
  VOR_Stream* position = plugin.acquire(layer, HOST_STREAM_POSITION);
};

TEST_F(Batches, KeysShowFromTheCommitOn) {
  VOR_AddKeyframesInfo* batch = plugin.open(rotation);
  plugin.addKey(batch, rotation, {1, 10}, 5.0);
  std::int32_t count = -1;
  kKeyframeSuite3.GetStreamKeyframeCount(rotation, &count);
  EXPECT_EQ(count, 0);
  EXPECT_EQ(kKeyframeSuite3.EndKeyframeBatch(1, batch), 0);
  kKeyframeSuite3.GetStreamKeyframeCount(rotation, &count);
  EXPECT_EQ(count, 1);
}

TEST_F(Batches, CommitSortsByTimeAndCarriesTheValuesAlong) {
  VOR_AddKeyframesInfo* batch = plugin.open(position);
  plugin.addKey(batch, position, {3, 10}, 1.0, 2.0, 3.0);
  plugin.addKey(batch, position, {-1, 10}, 4.0, 5.0, 6.0);
  plugin.addKey(batch, position, {1, 5}, 7.0, 8.0, 9.0);
  kKeyframeSuite3.EndKeyframeBatch(1, batch);
  const KeyColumns& keys = *streamOf(plugin, HOST_STREAM_POSITION).keys;
  EXPECT_THAT(keys.times, ElementsAre(T_Time{-1, 10}, T_Time{1, 5}, T_Time{3, 10}));
  EXPECT_THAT(keys.values, ElementsAre(4.0, 5.0, 6.0, 7.0, 8.0, 9.0, 1.0, 2.0, 3.0));
}

TEST_F(Batches, OfKeysAtEqualTimesTheLaterStays) {
  VOR_AddKeyframesInfo* batch = plugin.open(rotation);
  plugin.addKey(batch, rotation, {1, 2}, 1.0);
  plugin.addKey(batch, rotation, {0, 1}, 2.0);
  plugin.addKey(batch, rotation, {2, 4}, 3.0);
  plugin.addKey(batch, rotation, {0, 7}, 4.0);
  kKeyframeSuite3.EndKeyframeBatch(1, batch);
  const KeyColumns& keys = *streamOf(plugin, HOST_STREAM_ROTATION_Z).keys;
  EXPECT_THAT(keys.times, ElementsAre(T_Time{0, 7}, T_Time{2, 4}));
  EXPECT_THAT(keys.values, ElementsAre(4.0, 3.0));
}

TEST_F(Batches, KeyWithoutValueIsDropped) {
  VOR_AddKeyframesInfo* batch = plugin.open(position);
  std::int32_t index = -1;
  const T_Time early{1, 10};
  kKeyframeSuite3.AddBatchKeyframe(batch, 0, &early, &index);
  EXPECT_EQ(index, 0);
  plugin.addKey(batch, position, {2, 10}, 1.0, 2.0, 3.0);
  const T_Time late{3, 10};
  kKeyframeSuite3.AddBatchKeyframe(batch, 0, &late, &index);
  EXPECT_EQ(index, 2);
  kKeyframeSuite3.EndKeyframeBatch(1, batch);
  EXPECT_THAT(streamOf(plugin, HOST_STREAM_POSITION).keys->times, ElementsAre(T_Time{2, 10}));
  EXPECT_THAT(streamOf(plugin, HOST_STREAM_POSITION).keys->values, ElementsAre(1.0, 2.0, 3.0));
}

TEST_F(Batches, KeyWithoutValueDoesNotReplaceOneAtItsTime) {
  VOR_AddKeyframesInfo* batch = plugin.open(rotation);
  plugin.addKey(batch, rotation, {2, 10}, 1.0);
  std::int32_t index = -1;
  const T_Time same{2, 10};
  kKeyframeSuite3.AddBatchKeyframe(batch, 0, &same, &index);
  kKeyframeSuite3.EndKeyframeBatch(1, batch);
  EXPECT_THAT(streamOf(plugin, HOST_STREAM_ROTATION_Z).keys->values, ElementsAre(1.0));
}

TEST_F(Batches, CommitOfNoKeysLeavesTheStreamWithoutKeys) {
  EXPECT_EQ(kKeyframeSuite3.EndKeyframeBatch(1, plugin.open(rotation)), 0);
  EXPECT_EQ(streamOf(plugin, HOST_STREAM_ROTATION_Z).keys, nullptr);
  EXPECT_EQ(streamOf(plugin, HOST_STREAM_ROTATION_Z).keyCount(), 0U);
}

TEST_F(Batches, WithoutCommitNothingShows) {
  VOR_AddKeyframesInfo* batch = plugin.open(rotation);
  plugin.addKey(batch, rotation, {2, 10}, 1.0);
  EXPECT_EQ(kKeyframeSuite3.EndKeyframeBatch(0, batch), 0);
  EXPECT_EQ(streamOf(plugin, HOST_STREAM_ROTATION_Z).keyCount(), 0U);
}

TEST_F(Batches, LaterBatchMergesAndReplacesKeysAtItsTimes) {
  VOR_AddKeyframesInfo* first = plugin.open(rotation);
  plugin.addKey(first, rotation, {1, 1}, 1.0);
  plugin.addKey(first, rotation, {3, 1}, 3.0);
  kKeyframeSuite3.EndKeyframeBatch(1, first);
  VOR_AddKeyframesInfo* second = plugin.open(rotation);
  plugin.addKey(second, rotation, {2, 1}, 20.0);
  plugin.addKey(second, rotation, {30, 10}, 30.0);
  kKeyframeSuite3.EndKeyframeBatch(1, second);
  EXPECT_THAT(streamOf(plugin, HOST_STREAM_ROTATION_Z).keys->times,
              ElementsAre(T_Time{1, 1}, T_Time{2, 1}, T_Time{30, 10}));
  EXPECT_THAT(streamOf(plugin, HOST_STREAM_ROTATION_Z).keys->values, ElementsAre(1.0, 20.0, 30.0));
}

TEST_F(Batches, BatchOutlivesTheHandleThatOpenedIt) {
  VOR_AddKeyframesInfo* batch = plugin.open(rotation);
  kStreamSuite7.ReleaseStream(rotation);
  VOR_Stream* other = plugin.acquire(layer, HOST_STREAM_ROTATION_Z);
  plugin.addKey(batch, other, {1, 1}, 6.0);
  EXPECT_EQ(kKeyframeSuite3.EndKeyframeBatch(1, batch), 0);
  EXPECT_EQ(streamOf(plugin, HOST_STREAM_ROTATION_Z).keyCount(), 1U);
}

TEST_F(Batches, FiveBatchesOnFiveStreamsOfALayerAreOpenTogether) {
  std::vector<std::pair<VOR_AddKeyframesInfo*, VOR_Stream*>> open;
  for (const std::int32_t id : {2, 8, 9, 3, 1}) {
    VOR_Stream* stream = plugin.acquire(layer, id);
    open.emplace_back(plugin.open(stream), stream);
  }
  for (const auto& [batch, stream] : open) plugin.addKey(batch, stream, {1, 1}, 1.0);
  for (const auto& [batch, stream] : open) EXPECT_EQ(kKeyframeSuite3.EndKeyframeBatch(1, batch), 0);
  for (const std::int32_t id : {2, 8, 9, 3, 1}) EXPECT_EQ(streamOf(plugin, id).keyCount(), 1U) << id;
}

TEST_F(Batches, StaticValueStaysWhenKeysAreAdded) {
  const StreamValueRecord value{rotation, {45.0, 0.0, 0.0, 0.0}};
  kStreamSuite8.SetStreamValue(kPluginId, rotation, &value);
  VOR_AddKeyframesInfo* batch = plugin.open(rotation);
  plugin.addKey(batch, rotation, {1, 1}, 6.0);
  kKeyframeSuite3.EndKeyframeBatch(1, batch);
  EXPECT_DOUBLE_EQ(streamOf(plugin, HOST_STREAM_ROTATION_Z).value[0], 45.0);
}

TEST_F(Batches, ValueGivenTwiceIsTheSecond) {
  VOR_AddKeyframesInfo* batch = plugin.open(rotation);
  plugin.addKey(batch, rotation, {1, 1}, 6.0);
  const StreamValueRecord again{rotation, {7.0, 0.0, 0.0, 0.0}};
  EXPECT_EQ(kKeyframeSuite4.SetBatchKeyframeValue(batch, 0, &again), 0);
  kKeyframeSuite3.EndKeyframeBatch(1, batch);
  EXPECT_THAT(streamOf(plugin, HOST_STREAM_ROTATION_Z).keys->values, ElementsAre(7.0));
}

TEST(KeyTimes, AreComparedExactly) {
  EXPECT_TRUE(timeLess({INT32_MAX - 1, UINT32_MAX}, {INT32_MAX, UINT32_MAX}));
  EXPECT_FALSE(timeLess({INT32_MAX, UINT32_MAX}, {INT32_MAX, UINT32_MAX}));
  EXPECT_TRUE(timeLess({INT32_MIN, 1}, {INT32_MIN, UINT32_MAX}));
  EXPECT_FALSE(timeLess({1, 3}, {2, 6}));
  EXPECT_FALSE(timeLess({2, 6}, {1, 3}));
  EXPECT_TRUE(timeLess({333333333, 1000000000}, {1, 3}));
  EXPECT_TRUE(timeLess({-1, 3}, {0, 9}));
}

TEST(KeyTimes, OfScaleZeroComeAfterAllOthersByTheirValue) {
  EXPECT_TRUE(timeLess({INT32_MAX, 1}, {-5, 0}));
  EXPECT_FALSE(timeLess({-5, 0}, {INT32_MAX, 1}));
  EXPECT_TRUE(timeLess({-5, 0}, {0, 0}));
  EXPECT_FALSE(timeLess({0, 0}, {0, 0}));
}

TEST(LongBatch, OfAMillionKeysInDescendingOrderIsSorted) {
  constexpr std::int32_t count = 1000000;
  Stream stream;
  stream.dimension = 1;
  Batch batch;
  batch.stream = &stream;
  for (std::int32_t key = 0; key < count; ++key) {
    batch.times.makeRoom(1);
    batch.addKey({count - key, 24000});
    const double value[] = {static_cast<double>(key), 0.0, 0.0};
    batch.setValue(static_cast<std::size_t>(key), value);
  }
  std::unique_ptr<KeyColumns> keys;
  KeyTimes last;
  commitKeys(batch, keys, &last);
  ASSERT_EQ(keys->times.size(), static_cast<std::size_t>(count));
  for (std::size_t key = 0; key < keys->times.size(); ++key) {
    ASSERT_EQ(keys->times[key].value, static_cast<std::int32_t>(key) + 1);
    ASSERT_DOUBLE_EQ(keys->values[key], static_cast<double>(count - 1 - static_cast<std::int32_t>(key)));
  }
}

TEST(SharedTimes, AreOfStreamsWithTheSameTimesAlone) {
  StandIn plugin;
  VOR_Layer* layer = plugin.makeNull(plugin.makeComp());
  const auto fill = [&](std::int32_t id, std::vector<T_Time> times) {
    VOR_Stream* stream = plugin.acquire(layer, id);
    VOR_AddKeyframesInfo* batch = plugin.open(stream);
    for (const T_Time& time : times) plugin.addKey(batch, stream, time, id);
    EXPECT_EQ(kKeyframeSuite3.EndKeyframeBatch(1, batch), 0);
    EXPECT_EQ(kStreamSuite7.ReleaseStream(stream), 0);
  };
  const auto timesOf = [&](std::int32_t id) {
    std::vector<std::int32_t> values;
    for (const T_Time& time : plugin.host().project().layers().back().findStream(id)->keys->times)
      values.push_back(time.value);
    return values;
  };
  const auto rowOf = [&](std::int32_t id) {
    return &plugin.host().project().layers().back().findStream(id)->keys->times[0];
  };
  fill(3, {{5, 24}, {2, 24}});
  fill(8, {{2, 24}, {5, 24}});
  fill(9, {{2, 24}, {6, 24}});
  EXPECT_EQ(rowOf(3), rowOf(8));
  EXPECT_NE(rowOf(8), rowOf(9));
  fill(8, {{3, 24}});
  EXPECT_EQ(timesOf(3), (std::vector<std::int32_t>{2, 5}));
  EXPECT_EQ(timesOf(8), (std::vector<std::int32_t>{2, 3, 5}));
  EXPECT_EQ(timesOf(9), (std::vector<std::int32_t>{2, 6}));
}

}  // namespace
}  // namespace refhost
