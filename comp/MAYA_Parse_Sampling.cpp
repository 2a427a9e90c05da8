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

}  // namespace

void NodeChannels::Extract(std::int32_t group, std::int32_t n, double (&values)[kAxisCount]) const {
  for (std::int32_t axis = 0; axis < kAxisCount; ++axis) {
    const Channel& channel = channels[static_cast<std::size_t>(kAxisCount * group + axis)];
    if (channel.count == 0) continue;
    values[axis] = FetchRecord<MAYA_Key>(channel.keys, channel.count == 1 ? 0 : n).value;
  }
}

std::int32_t MAYA_Parse::VerifyAnimInfo(const MAYA_Transform* node) {
  return VerifyChannels(*node).sharedCount;
}

T_Time MAYA_Parse::GetKeyTime(const MAYA_Transform* node, std::int32_t n) {
  return KeyTime(FetchChannels(*node), n);
}

void MAYA_Parse::ExtractAnimInfo(const MAYA_Transform* node, std::int32_t group, std::int32_t n,
                                 double (&values)[kAxisCount]) {
  FetchChannels(*node).Extract(group, n, values);
}

NodeChannels MAYA_Parse::FetchChannels(const MAYA_Transform& node) const {
  NodeChannels fetched;
  for (std::size_t slot = 0; slot < kChannelCount; ++slot) {
    fetched.channels[slot] = FetchChannel(curves, node.curve[slot]);
  }
  return fetched;
}

NodeChannels MAYA_Parse::VerifyChannels(const MAYA_Transform& node) {
  NodeChannels fetched = FetchChannels(node);
  std::int64_t shared = 0;
  for (const NodeChannels::Channel& channel : fetched.channels) {
    if (channel.count < kAnimatedKeyCount) continue;
    if (shared == 0) shared = channel.count;
    if (channel.count == shared) continue;
    // Deliberate: the text names a camera, whatever the node is.
    ReportError(LocalizedText(kInconsistentKeysMessage));
    throw int{kInconsistentKeys};
  }
  fetched.sharedCount = static_cast<std::int32_t>(shared);
  return fetched;
}

// The time of the first channel that has a key n. Deliberate: a constant channel may lend its time to key 0
// alone, so that later keys, measured from it, can lie before time 0.
T_Time MAYA_Parse::KeyTime(const NodeChannels& fetched, std::int32_t n) const {
  constexpr T_Time kNoTime{0, 1};
  for (const NodeChannels::Channel& channel : fetched.channels) {
    if (channel.count > n) return ConvertTime(FetchRecord<MAYA_Key>(channel.keys, n).time, n == 0 ? 1 : 0);
  }
  return kNoTime;
}
