// A failure, an exception or a refusal of one call does not reach the next call, with or without a trace.
// Tried on the operations that an import makes for every key: they take a short way.
#include <cmath>
#include <new>

#include "tests/refhost/StandIn.h"

namespace refhost {
namespace {

using ::testing::ElementsAre;
using ::testing::SizeIs;

constexpr T_Time kTime{5, 24};

// The parameter: whether a trace is written.
class Calls : public ::testing::TestWithParam<bool> {
 protected:
  explicit Calls(HostOptions options = {})
      : plugin(std::move(options), Callback::Import, GetParam()), layer(plugin.makeNull(plugin.makeComp())) {}

  HostError acquire(std::int32_t pluginId, VOR_Layer* of, std::int32_t id, VOR_Stream** place) {
    return kStreamSuite7.AcquireLayerStream(pluginId, of, id, place);
  }
  HostError add(VOR_AddKeyframesInfo* batch, std::int32_t timeMode, const T_Time* time, std::int32_t* index) {
    return kKeyframeSuite3.AddBatchKeyframe(batch, timeMode, time, index);
  }
  HostError set(VOR_AddKeyframesInfo* batch, std::int32_t index, const StreamValueRecord* value) {
    return kKeyframeSuite4.SetBatchKeyframeValue(batch, index, value);
  }

  StandIn plugin;
  VOR_Layer* layer;
};

TEST_P(Calls, EachRefusalOfAStreamIsOfItsCallAlone) {
  VOR_Stream* stream = nullptr;
  VOR_Stream* other = nullptr;
  const auto succeeds = [&] {
    EXPECT_EQ(acquire(kPluginId, layer, HOST_STREAM_ROTATION_Z, &stream), 0);
    EXPECT_EQ(kStreamSuite7.ReleaseStream(stream), 0);
  };
  succeeds();
  EXPECT_EQ(acquire(kPluginId + 1, layer, HOST_STREAM_ROTATION_Z, &other), HOST_ERR_BAD_PLUGIN_ID);
  succeeds();
  EXPECT_EQ(acquire(kPluginId, reinterpret_cast<VOR_Layer*>(&other), HOST_STREAM_ROTATION_Z, &other),
            HOST_ERR_BAD_HANDLE);
  succeeds();
  EXPECT_EQ(acquire(kPluginId, layer, HOST_STREAM_ROTATION_Z, nullptr), HOST_ERR_BAD_POINTER);
  succeeds();
  EXPECT_EQ(acquire(kPluginId, layer, HOST_STREAM_ZOOM, &other), HOST_ERR_NO_SUCH_STREAM);
  succeeds();
  EXPECT_EQ(kStreamSuite7.ReleaseStream(stream), HOST_ERR_BAD_HANDLE);
  succeeds();
  EXPECT_EQ(other, nullptr);
  EXPECT_THAT(plugin.leave().refusals, SizeIs(5));
}

TEST_P(Calls, EachRefusalOfAKeyIsOfItsCallAlone) {
  VOR_Stream* const stream = plugin.acquire(layer, HOST_STREAM_ROTATION_Z);
  VOR_Stream* const other = plugin.acquire(layer, HOST_STREAM_POSITION);
  VOR_AddKeyframesInfo* const batch = plugin.open(stream);
  std::int32_t index = -1;
  const auto succeeds = [&](std::int32_t next) {
    const StreamValueRecord value{stream, {7.0 + next, 0.0, 0.0, 0.0}};
    const T_Time time{next, 24};
    EXPECT_EQ(add(batch, 0, &time, &index), 0);
    EXPECT_EQ(index, next);
    EXPECT_EQ(set(batch, index, &value), 0);
  };
  constexpr T_Time kNoScale{5, 0};
  const StreamValueRecord value{stream, {1.0, 0.0, 0.0, 0.0}};
  const StreamValueRecord ofOther{other, {1.0, 0.0, 0.0, 0.0}};
  const StreamValueRecord infinite{stream, {HUGE_VAL, 0.0, 0.0, 0.0}};
  succeeds(0);
  EXPECT_EQ(add(nullptr, 0, &kTime, &index), HOST_ERR_BAD_HANDLE);
  succeeds(1);
  EXPECT_EQ(add(batch, 0, nullptr, &index), HOST_ERR_BAD_POINTER);
  succeeds(2);
  EXPECT_EQ(add(batch, 1, &kTime, &index), HOST_ERR_BAD_TIME_MODE);
  succeeds(3);
  EXPECT_EQ(add(batch, 0, &kNoScale, &index), HOST_ERR_BAD_TIME);
  succeeds(4);
  EXPECT_EQ(set(batch, 5, &value), HOST_ERR_BATCH_KEY);
  EXPECT_EQ(set(batch, -1, &value), HOST_ERR_BATCH_KEY);
  succeeds(5);
  EXPECT_EQ(set(batch, 0, &ofOther), HOST_ERR_BATCH_KEY);
  succeeds(6);
  EXPECT_EQ(set(batch, 0, &infinite), HOST_ERR_BAD_VALUE);
  succeeds(7);
  EXPECT_EQ(set(batch, 0, nullptr), HOST_ERR_BAD_POINTER);
  succeeds(8);
  EXPECT_EQ(kKeyframeSuite3.EndKeyframeBatch(1, batch), 0);
  EXPECT_THAT(plugin.host().project().layers().back().findStream(HOST_STREAM_ROTATION_Z)->keys->values,
              ElementsAre(7, 8, 9, 10, 11, 12, 13, 14, 15));
  EXPECT_THAT(plugin.leave().refusals, SizeIs(9));
}

TEST_P(Calls, NumbersThatAStreamDoesNotHaveMayBeAnything) {
  VOR_Stream* const stream = plugin.acquire(layer, HOST_STREAM_ROTATION_Z);
  VOR_AddKeyframesInfo* const batch = plugin.open(stream);
  const StreamValueRecord value{stream, {7.0, std::nan(""), HUGE_VAL, std::nan("")}};
  std::int32_t index = -1;
  EXPECT_EQ(add(batch, 0, &kTime, &index), 0);
  EXPECT_EQ(set(batch, index, &value), 0);
  EXPECT_EQ(kKeyframeSuite3.EndKeyframeBatch(1, batch), 0);
  EXPECT_THAT(plugin.host().project().layers().back().findStream(HOST_STREAM_ROTATION_Z)->keys->values,
              ElementsAre(7.0));
}

INSTANTIATE_TEST_SUITE_P(WithAndWithoutATrace, Calls, ::testing::Bool(),
                         [](const auto& traced) { return traced.param ? "Traced" : "Untraced"; });

// A rehearsal of the second call of the operation, which ends in an exception.
class RehearsedCalls : public Calls {
 protected:
  RehearsedCalls() : Calls(withFailure({"ReleaseStream", 2, false, Failure::Kind::BadAlloc, 0})) {}
};

TEST_P(RehearsedCalls, AnExceptionIsOfItsCallAlone) {
  VOR_Stream* const first = plugin.acquire(layer, HOST_STREAM_ROTATION_Z);
  VOR_Stream* const second = plugin.acquire(layer, HOST_STREAM_ROTATION_Z);
  EXPECT_EQ(kStreamSuite7.ReleaseStream(first), 0);
  EXPECT_THROW(kStreamSuite7.ReleaseStream(second), std::bad_alloc);
  EXPECT_EQ(kStreamSuite7.ReleaseStream(second), 0) << "it was not released";
  VOR_Stream* third = nullptr;
  EXPECT_EQ(acquire(kPluginId, layer, HOST_STREAM_ROTATION_Z, &third), 0);
}

INSTANTIATE_TEST_SUITE_P(WithAndWithoutATrace, RehearsedCalls, ::testing::Bool(),
                         [](const auto& traced) { return traced.param ? "Traced" : "Untraced"; });

}  // namespace
}  // namespace refhost
