// Remembers where the keys of the nine channels of one node lie, so that they can be read without a call of
// the list for each key.
//
// The node is recognised by its nine curve indices, never by its address: copies of one record are one node,
// and another record at the same address is another. The class is in this room because the parser keeps one.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>

#include "maya/SceneRecords.h"

namespace mayaimport {

class NodeChannels {
 public:
  // The keys of one channel's curve.
  struct Channel {
    const RecordList* keys = nullptr;  // null when the channel has no curve, or its curve no keys
    std::int64_t count = 0;
    const MAYA_Key* run = nullptr;  // all of them, one after the other; null until FetchRuns
    std::int64_t step = 0;          // keys from one sample to the next; 0 for a constant channel
  };

  // Of a node without curves.
  NodeChannels() { curves_.fill(kNoIndex); }

  // Looks a curve's keys up, whichever channel it drives; -1 has none. Throws the list's code.
  static Channel Find(const RecordList* curves, std::int32_t curve);

  // Takes the next channel of the node, from slot 0 on. False when it is animated and its key count differs
  // from that of the animated ones before it. Throws the list's code.
  bool TakeNext(const RecordList* curves, const MAYA_Transform& node);

  // The key count of the channels that have two keys or more; 0 when none has.
  std::int32_t sharedCount() const { return static_cast<std::int32_t>(sharedCount_); }

  // Whether these are the channels of the node.
  bool AreOf(const MAYA_Transform& node) const {
    std::uint32_t difference = 0;
    for (std::size_t slot = 0; slot < kChannelCount; ++slot) {
      difference |= static_cast<std::uint32_t>(curves_[slot]) ^ static_cast<std::uint32_t>(node.curve[slot]);
    }
    return difference == 0;
  }

  // Fetches the keys of all channels, where any is animated. Throws the list's code. After a failure, or when
  // a list hands nothing out, FindTime and Extract find nothing. Valid until a curve's keys change.
  void FetchRuns();

  // The key whose time sample n has: that of the first channel with a key n. Null when the node is another
  // one, or its keys are not fetched.
  const MAYA_Key* FindTime(const MAYA_Transform& node, std::int32_t n) const {
    if (!Hold(node, n)) return nullptr;
    const Channel* channel = channels_.data();
    while (channel->count <= n) ++channel;  // an animated one has it
    return channel->run + n * channel->step;
  }

  // Overwrites the axes of the group that have keys with those of sample n. False, and nothing written, when
  // the node is another one, or its keys are not fetched.
  bool Extract(const MAYA_Transform& node, std::int32_t group, std::int32_t n,
               double (&values)[kAxisCount]) const {
    if (!Hold(node, n)) return false;
    const Channel* const channel = channels_.data() + kAxisCount * group;
    for (int axis = 0; axis < kAxisCount; ++axis) {
      if (channel[axis].run != nullptr) values[axis] = channel[axis].run[n * channel[axis].step].value;
    }
    return true;
  }

 private:
  bool Hold(const MAYA_Transform& node, std::int32_t n) const {
    return static_cast<std::uint32_t>(n) < fetchedSamples_ && AreOf(node);
  }

  std::array<std::int32_t, kChannelCount> curves_;
  std::uint32_t fetchedSamples_ = 0;
  std::array<Channel, kChannelCount> channels_;
  std::size_t taken_ = 0;  // channels
  std::int64_t sharedCount_ = 0;
};

}  // namespace mayaimport
