// The keys of a node, by index: scenes are baked, so that the n-th key of every channel belongs to the n-th
// time. Reads `curves`; calls the utility suite only to show a message.
#include "comp/NodeChannels.h"
#include "maya/ListAccess.h"
#include "maya/MAYA_Parse.h"

namespace {

// A curve with fewer keys is a constant.
constexpr std::int64_t kAnimatedKeyCount = 2;

NodeChannels::Channel FetchChannel(const RecordList* curves, std::int32_t curve) {
  if (curve < 0) return {};
  const auto record = FetchRecord<MAYA_AnimCurve>(curves, curve);
  return {record.keys, RecordCount(record.keys)};
}

MAYA_Key FetchKey(const NodeChannels::Channel& channel, std::int32_t n) {
  return channel.run != nullptr ? channel.run[n] : FetchRecord<MAYA_Key>(channel.keys, n);
}

// Writes key n of a channel; a channel of one key gives that one, a channel without keys leaves the value.
void ReadKey(const NodeChannels::Channel& channel, std::int32_t n, double* value) {
  if (channel.count == 0) return;
  *value = FetchKey(channel, channel.count == 1 ? 0 : n).value;
}

}  // namespace

void NodeChannels::Extract(std::int32_t group, std::int32_t n, double (&values)[kAxisCount]) const {
  for (std::int32_t axis = 0; axis < kAxisCount; ++axis) {
    const std::int32_t slot = kAxisCount * group + axis;
    ReadKey(channels[static_cast<std::size_t>(slot)], n, &values[axis]);
  }
}

void NodeChannels::ListSampled() {
  for (const int group : {kScaleGroup, kRotateGroup, kTranslateGroup}) {
    for (int slot = kAxisCount * group; slot < kAxisCount * (group + 1); ++slot) {
      const auto place = static_cast<std::uint8_t>(slot);
      if (channels[place].count != 0) sampled[sampledCount++] = place;
    }
  }
}

void NodeChannels::FetchRuns() {
  // Each sample reads each channel once, and one of them once more for its time.
  std::int64_t gets = std::int64_t{2} * sharedCount;
  for (std::size_t i = 0; i < sampledCount; ++i) {
    Channel& channel = channels[sampled[i]];
    channel.run = static_cast<const MAYA_Key*>(RecordListGetRun(channel.keys, 0, channel.count, gets));
    gets = sharedCount;
  }
}

void NodeChannels::Sample(std::int32_t n, double (&values)[kChannelCount]) const {
  for (std::size_t i = 0; i < sampledCount; ++i) ReadKey(channels[sampled[i]], n, &values[sampled[i]]);
}

std::int32_t MAYA_Parse::VerifyAnimInfo(const MAYA_Transform* node) {
  return VerifyChannels(*node).sharedCount;
}

T_Time MAYA_Parse::GetKeyTime(const MAYA_Transform* node, std::int32_t n) {
  NodeChannels fetched;
  for (std::size_t slot = 0; slot < kChannelCount; ++slot) {
    fetched.channels[slot] = FetchChannel(curves, node->curve[slot]);
    if (fetched.channels[slot].count > n) break;  // a curve behind it is not looked at
  }
  return KeyTime(fetched, n);
}

void MAYA_Parse::ExtractAnimInfo(const MAYA_Transform* node, std::int32_t group, std::int32_t n,
                                 double (&values)[kAxisCount]) {
  for (std::int32_t axis = 0; axis < kAxisCount; ++axis) {
    ReadKey(FetchChannel(curves, node->curve[kAxisCount * group + axis]), n, &values[axis]);
  }
}

NodeChannels MAYA_Parse::VerifyChannels(const MAYA_Transform& node) {
  NodeChannels fetched;
  std::int64_t shared = 0;
  for (std::size_t slot = 0; slot < kChannelCount; ++slot) {
    NodeChannels::Channel& channel = fetched.channels[slot];
    channel = FetchChannel(curves, node.curve[slot]);
    if (channel.count < kAnimatedKeyCount) continue;
    if (shared == 0) shared = channel.count;
    if (channel.count == shared) continue;
    // Deliberate: the text names a camera, whatever the node is.
    ReportError(LocalizedText(kInconsistentKeysMessage));
    ThrowCode(kInconsistentKeys);
  }
  fetched.ListSampled();
  fetched.sharedCount = static_cast<std::int32_t>(shared);
  return fetched;
}

// The time of the first channel that has a key n. Deliberate: a constant channel may lend its time to key 0
// alone, so that later keys, measured from it, can lie before time 0.
T_Time MAYA_Parse::KeyTime(const NodeChannels& fetched, std::int32_t n) const {
  constexpr T_Time kNoTime{0, 1};
  for (const NodeChannels::Channel& channel : fetched.channels) {
    if (channel.count > n) return ConvertTime(FetchKey(channel, n).time, n == 0 ? 1 : 0);
  }
  return kNoTime;
}
