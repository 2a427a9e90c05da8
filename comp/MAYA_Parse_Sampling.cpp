// The keys of a node, by index: scenes are baked, so the n-th key of every channel belongs to the n-th time.
// Reads `curves`; calls the utility suite only to show a message.
//
// VerifyAnimInfo remembers what it found, so that the two others, which are called for every key, need no
// list. For another node they read the lists themselves.
#include "maya/ListAccess.h"
#include "maya/MAYA_Parse.h"
#include "maya/NodeChannels.h"

namespace mayaimport {

std::int32_t MAYA_Parse::VerifyAnimInfo(const MAYA_Transform* node) {
  channels_ = NodeChannels();
  NodeChannels found;
  for (int slot = 0; slot < kChannelCount; ++slot) {
    if (found.TakeNext(curves, *node)) continue;
    // Deliberate: the text names a camera, whatever the node is.
    ReportError(LocalizedText(kInconsistentKeysMessage));
    ThrowCode(kInconsistentKeys);
  }
  channels_ = found;
  return found.sharedCount();
}

T_Time MAYA_Parse::GetKeyTime(const MAYA_Transform* node, std::int32_t n) {
  if (n == 0 && channels_.AreOf(*node)) channels_.FetchRuns();
  const MAYA_Key* const key = channels_.FindTime(*node, n);
  return key != nullptr ? ConvertTime(key->time, n == 0 ? 1 : 0) : FetchKeyTime(*node, n);
}

// The time of the first channel that has a key n. Deliberate: for key 0 that can be a constant channel, which
// has no later keys. Those are measured from its time and can lie before time 0.
T_Time MAYA_Parse::FetchKeyTime(const MAYA_Transform& node, std::int32_t n) {
  for (int slot = 0; slot < kChannelCount; ++slot) {
    const NodeChannels::Channel channel = NodeChannels::Find(curves, node.curve[slot]);
    if (channel.count <= n) continue;
    return ConvertTime(FetchRecord<MAYA_Key>(channel.keys, n).time, n == 0 ? 1 : 0);
  }
  return {0, 1};
}

void MAYA_Parse::FetchAnimInfo(const MAYA_Transform& node, std::int32_t group, std::int32_t n,
                               double (&values)[kAxisCount]) {
  for (std::int32_t axis = 0; axis < kAxisCount; ++axis) {
    const NodeChannels::Channel channel = NodeChannels::Find(curves, node.curve[kAxisCount * group + axis]);
    if (channel.count == 0) continue;
    values[axis] = FetchRecord<MAYA_Key>(channel.keys, channel.step == 0 ? 0 : n).value;
  }
}

}  // namespace mayaimport
