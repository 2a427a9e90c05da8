// What goes beyond a limit is refused with a code and a sentence, and what exists stays.
#include <cstdint>
#include <string>

#include "tests/refhost/RefusalScene.h"

namespace refhost {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;

HostOptions layersAtMost(std::int32_t most) {
  HostOptions options;
  options.mostLayers = most;
  return options;
}

HostOptions keysAtMost(std::int32_t most, std::int32_t zoomKeys = 0) {
  HostOptions options;
  options.mostKeys = most;
  options.zoomKeys = zoomKeys;
  return options;
}

HostOptions memoryAtMost(std::int64_t most) {
  HostOptions options;
  options.mostMemory = most;
  return options;
}

HostError newNull(VOR_CompItem* comp) {
  VOR_Layer* layer = nullptr;
  const T_Time time{0, 1};
  const HostError code = kCompSuite9.NewNullLayer("n", comp, &time, &layer);
  EXPECT_EQ(layer == nullptr, code != 0);
  return code;
}

HostError newCamera(VOR_CompItem* comp) {
  VOR_Layer* layer = nullptr;
  const HostError code = kCompSuite9.NewCameraLayer("c", comp, 1.0, 2.0, &layer);
  EXPECT_EQ(layer == nullptr, code != 0);
  return code;
}

HostError addKey(VOR_AddKeyframesInfo* batch, std::int32_t at, VOR_Stream* stream) {
  const T_Time time{at, 1};
  std::int32_t index = -1;
  const HostError code = kKeyframeSuite3.AddBatchKeyframe(batch, 0, &time, &index);
  EXPECT_EQ(index == -1, code != 0);
  if (code != 0) return code;
  const StreamValueRecord record{stream, {1.0 + at, 0.0, 0.0, 0.0}};
  EXPECT_EQ(kKeyframeSuite4.SetBatchKeyframeValue(batch, index, &record), 0);
  return 0;
}

HostError newBlock(std::int64_t size, HostMemHandle** handle) {
  *handle = nullptr;
  return kMemorySuite1.NewMemHandle(kPluginId, "block", size, 0, handle);
}

TEST(Limits, ALayerBeyondTheMostIsRefusedWhateverItsKind) {
  StandIn plugin(layersAtMost(2));
  VOR_CompItem* inner = plugin.makeComp();
  VOR_CompItem* outer = plugin.makeComp();
  EXPECT_EQ(newNull(inner), 0);
  EXPECT_EQ(newCamera(inner), 0);
  EXPECT_EQ(newNull(inner), HOST_ERR_TOO_MANY_LAYERS);
  EXPECT_EQ(newCamera(outer), HOST_ERR_TOO_MANY_LAYERS);
  VOR_Item* item = nullptr;
  VOR_Layer* layer = nullptr;
  ASSERT_EQ(kCompSuite9.GetItemFromComp(inner, &item), 0);
  EXPECT_EQ(kLayerSuite10.AddLayerFromItem(item, outer, &layer), HOST_ERR_TOO_MANY_LAYERS);
  EXPECT_EQ(plugin.host().project().layers().size(), 2u);
  EXPECT_THAT(plugin.leave().refusals, ElementsAre("NewNullLayer: the host takes no more than 2 layers",
                                                   "NewCameraLayer: the host takes no more than 2 layers",
                                                   "AddLayerFromItem: the host takes no more than 2 layers"));
}

TEST(Limits, ANestedLayerCountsAsWell) {
  StandIn plugin(layersAtMost(1));
  VOR_CompItem* inner = plugin.makeComp();
  VOR_Item* item = nullptr;
  VOR_Layer* layer = nullptr;
  ASSERT_EQ(kCompSuite9.GetItemFromComp(inner, &item), 0);
  ASSERT_EQ(kLayerSuite10.AddLayerFromItem(item, plugin.makeComp(), &layer), 0);
  EXPECT_EQ(newNull(inner), HOST_ERR_TOO_MANY_LAYERS);
}

TEST(Limits, LayersOfAnEarlierSceneCountAndStay) {
  StandIn plugin(layersAtMost(1));
  plugin.makeNull(plugin.makeComp());
  plugin.leave();
  plugin.enterAgain(Callback::Import);
  EXPECT_EQ(newNull(plugin.makeComp()), HOST_ERR_TOO_MANY_LAYERS);
  EXPECT_EQ(plugin.host().project().layers().size(), 1u);
}

class KeyLimit : public testing::Test {
 protected:
  explicit KeyLimit(std::int32_t most = 3) : plugin(keysAtMost(most)) {}

  StandIn plugin;
  VOR_Layer* layer = plugin.makeNull(plugin.makeComp());
  VOR_Stream* turn = plugin.acquire(layer, HOST_STREAM_ROTATION_Z);
  VOR_Stream* tilt = plugin.acquire(layer, HOST_STREAM_ROTATION_X);
  VOR_AddKeyframesInfo* batch = plugin.open(turn);
};

TEST_F(KeyLimit, AKeyBeyondTheMostIsRefusedAndTheOthersStay) {
  for (std::int32_t at = 0; at < 3; ++at) EXPECT_EQ(addKey(batch, at, turn), 0);
  EXPECT_EQ(addKey(batch, 3, turn), HOST_ERR_TOO_MANY_KEYS);
  EXPECT_EQ(kKeyframeSuite3.EndKeyframeBatch(1, batch), 0);
  const Stream* stream = plugin.host().project().layers()[0].findStream(HOST_STREAM_ROTATION_Z);
  EXPECT_THAT(stream->keys->values, ElementsAre(1.0, 2.0, 3.0));
  EXPECT_THAT(plugin.leave().refusals, ElementsAre("AddBatchKeyframe: the host takes no more than 3 keys"));
}

TEST_F(KeyLimit, KeysOfAllOpenBatchesCount) {
  VOR_AddKeyframesInfo* other = plugin.open(tilt);
  EXPECT_EQ(addKey(batch, 0, turn), 0);
  EXPECT_EQ(addKey(other, 0, tilt), 0);
  EXPECT_EQ(addKey(batch, 1, turn), 0);
  EXPECT_EQ(addKey(other, 1, tilt), HOST_ERR_TOO_MANY_KEYS);
}

TEST_F(KeyLimit, CommittedKeysCount) {
  for (std::int32_t at = 0; at < 3; ++at) EXPECT_EQ(addKey(batch, at, turn), 0);
  EXPECT_EQ(kKeyframeSuite3.EndKeyframeBatch(1, batch), 0);
  EXPECT_EQ(addKey(plugin.open(tilt), 0, tilt), HOST_ERR_TOO_MANY_KEYS);
}

TEST_F(KeyLimit, KeysThatAreNotKeptMakeRoomForOthers) {
  const T_Time time{7, 1};
  std::int32_t index = 0;
  EXPECT_EQ(addKey(batch, 5, turn), 0);
  EXPECT_EQ(addKey(batch, 5, turn), 0);                                     // takes the other's place
  EXPECT_EQ(kKeyframeSuite3.AddBatchKeyframe(batch, 0, &time, &index), 0);  // never gets a value
  EXPECT_EQ(addKey(batch, 8, turn), HOST_ERR_TOO_MANY_KEYS);
  EXPECT_EQ(kKeyframeSuite3.EndKeyframeBatch(1, batch), 0);
  batch = plugin.open(tilt);
  EXPECT_EQ(addKey(batch, 0, tilt), 0);
  EXPECT_EQ(addKey(batch, 1, tilt), 0);
  EXPECT_EQ(addKey(batch, 2, tilt), HOST_ERR_TOO_MANY_KEYS);
  EXPECT_EQ(kKeyframeSuite3.EndKeyframeBatch(0, batch), 0);  // given up
  batch = plugin.open(tilt);
  EXPECT_EQ(addKey(batch, 3, tilt), 0);
  EXPECT_EQ(addKey(batch, 4, tilt), 0);
  EXPECT_EQ(addKey(batch, 5, tilt), HOST_ERR_TOO_MANY_KEYS);
}

TEST_F(KeyLimit, KeysOfABatchThatWasLeftBehindMakeRoomForOthers) {
  for (std::int32_t at = 0; at < 3; ++at) EXPECT_EQ(addKey(batch, at, turn), 0);
  EXPECT_THAT(plugin.leave().leftovers[2].description, HasSubstr("batch:1"));
  plugin.enterAgain(Callback::Import);
  turn = plugin.acquire(layer, HOST_STREAM_ROTATION_Z);
  batch = plugin.open(turn);
  for (std::int32_t at = 0; at < 3; ++at) EXPECT_EQ(addKey(batch, at, turn), 0);
  EXPECT_EQ(addKey(batch, 3, turn), HOST_ERR_TOO_MANY_KEYS);
}

// The calls that nobody watches take a way of their own.
TEST(Limits, AKeyBeyondTheMostIsRefusedWithoutATraceToo) {
  constexpr std::int32_t kMost = 100;  // more than a batch first has room for
  HostOptions options = keysAtMost(kMost);
  options.pluginId = kPluginId;
  Host host(options);
  VOR_Item* folder = host.beginCallback(Callback::Import, "scene.ma");
  const HostRatio one{1, 1};
  const T_Time second{1, 1};
  VOR_CompItem* comp = nullptr;
  VOR_Layer* layer = nullptr;
  VOR_Stream* stream = nullptr;
  VOR_AddKeyframesInfo* batch = nullptr;
  ASSERT_EQ(kCompSuite21.CreateComp(folder, kName, 64, 48, &one, &second, &one, &comp), 0);
  ASSERT_EQ(kCompSuite9.NewNullLayer("n", comp, &second, &layer), 0);
  ASSERT_EQ(kStreamSuite7.AcquireLayerStream(kPluginId, layer, HOST_STREAM_ROTATION_Z, &stream), 0);
  ASSERT_EQ(kKeyframeSuite3.BeginKeyframeBatch(stream, &batch), 0);
  for (std::int32_t at = 0; at < kMost; ++at) ASSERT_EQ(addKey(batch, at, stream), 0) << at;
  EXPECT_EQ(addKey(batch, kMost, stream), HOST_ERR_TOO_MANY_KEYS);
  EXPECT_EQ(kKeyframeSuite3.EndKeyframeBatch(1, batch), 0);
  EXPECT_EQ(host.project().layers()[0].findStream(HOST_STREAM_ROTATION_Z)->keyCount(), std::size_t{kMost});
}

TEST(Limits, TheKeysOnANewCamerasZoomCount) {
  StandIn plugin(keysAtMost(5, 2));
  VOR_CompItem* comp = plugin.makeComp();
  EXPECT_EQ(newCamera(comp), 0);
  EXPECT_EQ(newCamera(comp), 0);
  EXPECT_EQ(newCamera(comp), HOST_ERR_TOO_MANY_KEYS);
  EXPECT_EQ(newNull(comp), 0) << "a layer without keys";
  EXPECT_EQ(plugin.host().project().layers().size(), 3u);
}

TEST(Limits, MemoryBeyondTheMostIsRefusedUntilSomeIsGivenBack) {
  StandIn plugin(memoryAtMost(100));
  HostMemHandle* first = nullptr;
  HostMemHandle* second = nullptr;
  EXPECT_EQ(newBlock(60, &first), 0);
  EXPECT_EQ(newBlock(41, &second), HOST_ERR_TOO_MUCH_MEMORY);
  EXPECT_EQ(second, nullptr);
  EXPECT_EQ(newBlock(40, &second), 0);
  EXPECT_EQ(kMemorySuite1.FreeMemHandle(first), 0);
  EXPECT_EQ(newBlock(61, &first), HOST_ERR_TOO_MUCH_MEMORY);
  EXPECT_EQ(newBlock(60, &first), 0);
  EXPECT_THAT(plugin.leave().refusals,
              ElementsAre("NewMemHandle: 41 bytes are more than the 40 that are left of 100",
                          "NewMemHandle: 61 bytes are more than the 60 that are left of 100"));
  plugin.enterAgain(Callback::Import);
  EXPECT_EQ(newBlock(100, &first), 0) << "the blocks that were left behind are gone";
}

TEST(Limits, LimitsBelowZeroAreZero) {
  HostOptions options = layersAtMost(-1);
  options.mostKeys = -1;
  options.mostMemory = -1;
  StandIn plugin(options);
  HostMemHandle* block = nullptr;
  EXPECT_EQ(newNull(plugin.makeComp()), HOST_ERR_TOO_MANY_LAYERS);
  EXPECT_EQ(newBlock(1, &block), HOST_ERR_TOO_MUCH_MEMORY);
  EXPECT_EQ(newBlock(0, &block), 0);
}

}  // namespace
}  // namespace refhost
