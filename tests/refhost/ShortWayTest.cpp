// The operations that are called for every key do the same on a host that nobody watches, where they are
// short, as on one that writes a trace.
#include <cmath>
#include <limits>

#include "tests/refhost/StandIn.h"
#include "tests/support/SplitMix.h"

namespace refhost {
namespace {

constexpr int kCalls = 400;
constexpr std::int32_t kStreams[] = {1, 3, 9, 77};  // the last is none

// What a plug-in and its user see.
struct Seen {
  std::vector<std::int64_t> answers;
  std::vector<std::string> refusals;
  std::vector<std::string> leftovers;
  std::vector<double> keys;
  std::int64_t suiteCalls = 0;
  bool operator==(const Seen&) const = default;
};

class Caller {
 public:
  Caller(std::uint64_t seed, bool traced) : state_(seed), plugin_(ceilings(), Callback::Import, traced) {
    layer_ = plugin_.makeNull(plugin_.makeComp());
  }

  Seen run() {
    for (int i = 0; i < kCalls; ++i) callSomething();
    for (VOR_AddKeyframesInfo* batch : batches_) {
      if (batch != nullptr) note(kKeyframeSuite3.EndKeyframeBatch(pick(4) != 0, batch));
    }
    for (const Stream& stream : plugin_.host().project().layers().back().streams) look(stream);
    CallbackResult result = plugin_.leave();
    seen_.refusals = result.refusals;
    seen_.suiteCalls = result.suiteCalls;
    for (const Leftover& leftover : result.leftovers) seen_.leftovers.push_back(leftover.description);
    return seen_;
  }

 private:
  static HostOptions ceilings() {
    HostOptions options;
    options.mostKeys = 60;
    return options;
  }

  std::size_t pick(std::size_t below) {
    return static_cast<std::size_t>(testsupport::SplitMix(&state_) >> 32) % below;
  }
  bool rarely() { return pick(12) == 0; }
  void note(std::int64_t answer) { seen_.answers.push_back(answer); }

  void look(const Stream& stream) {
    if (stream.keys == nullptr) return;
    for (const T_Time& time : stream.keys->times) seen_.keys.push_back(time.value + 1e-3 * time.scale);
    seen_.keys.insert(seen_.keys.end(), stream.keys->values.begin(), stream.keys->values.end());
  }

  void callSomething() {
    const std::size_t slot = pick(3);
    switch (pick(8)) {
      case 0:
        return acquire(slot);
      case 1:
        return note(kStreamSuite7.ReleaseStream(rarely() ? nullptr : streams_[slot]));
      case 2:
        if (batches_[slot] == nullptr)
          note(kKeyframeSuite3.BeginKeyframeBatch(streams_[slot], &batches_[slot]));
        return;
      case 3:
      case 4:
      case 5:
        return addKey(slot);
      default:
        return setValue(slot);
    }
  }

  void acquire(std::size_t slot) {
    VOR_Stream* stream = nullptr;
    const std::size_t id = rarely() ? 3 : slot;
    const auto plugin = static_cast<std::int32_t>(rarely() ? 3 : kPluginId);
    auto* const layer = rarely() ? reinterpret_cast<VOR_Layer*>(&stream) : layer_;
    note(kStreamSuite7.AcquireLayerStream(plugin, layer, kStreams[id], rarely() ? nullptr : &stream));
    note(stream != nullptr ? 1 : 0);
    if (stream != nullptr) streams_[slot] = stream;
  }

  void addKey(std::size_t slot) {
    const T_Time time{static_cast<std::int32_t>(pick(90)), rarely() ? 0u : 24u};
    std::int32_t index = -1;
    note(kKeyframeSuite3.AddBatchKeyframe(rarely() ? nullptr : batches_[slot], rarely() ? 1 : 0,
                                          rarely() ? nullptr : &time, rarely() ? nullptr : &index));
    note(index);
    if (index >= 0) next_[slot] = index;
  }

  void setValue(std::size_t slot) {
    const double odd[] = {std::nan(""), std::numeric_limits<double>::infinity()};
    StreamValueRecord record{streams_[rarely() ? pick(3) : slot], {1.5, -2.5, 3.5, 0.0}};
    record.value[0] = static_cast<double>(pick(1000));
    if (rarely()) record.value[pick(3)] = odd[pick(2)];
    const std::int32_t index = rarely() ? static_cast<std::int32_t>(pick(9)) - 2 : next_[slot];
    note(kKeyframeSuite4.SetBatchKeyframeValue(batches_[slot], index, rarely() ? nullptr : &record));
  }

  std::uint64_t state_;
  StandIn plugin_;
  VOR_Layer* layer_ = nullptr;
  VOR_Stream* streams_[3] = {};
  VOR_AddKeyframesInfo* batches_[3] = {};
  std::int32_t next_[3] = {};
  Seen seen_;
};

TEST(ShortWay, DoesWhatTheLongWayDoes) {
  std::size_t keys = 0;
  std::size_t refusals = 0;
  for (std::uint64_t seed = 0; seed < 300; ++seed) {
    const Seen unwatched = Caller(seed, false).run();
    const Seen traced = Caller(seed, true).run();
    ASSERT_EQ(unwatched.answers, traced.answers) << seed;
    ASSERT_EQ(unwatched.refusals, traced.refusals) << seed;
    ASSERT_TRUE(unwatched == traced) << seed;
    keys += unwatched.keys.size();
    refusals += unwatched.refusals.size();
  }
  EXPECT_GT(keys, 3000u);
  EXPECT_GT(refusals, 3000u);
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
