#include "maya/NodeChannels.h"

#include "maya/ListAccess.h"

namespace mayaimport {

namespace {

// A curve with fewer keys is a constant.
constexpr std::int64_t kAnimatedKeyCount = 2;

}  // namespace

NodeChannels::Channel NodeChannels::Find(const RecordList* curves, std::int32_t curve) {
  if (curve < 0) return {};
  const auto record = FetchRecord<MAYA_AnimCurve>(curves, curve);
  const std::int64_t count = RecordCount(record.keys);
  return {record.keys, count, nullptr, count < kAnimatedKeyCount ? 0 : 1};
}

bool NodeChannels::TakeNext(const RecordList* curves, const MAYA_Transform& node) {
  const Channel channel = Find(curves, node.curve[taken_]);
  channels_[taken_] = channel;
  curves_[taken_] = node.curve[taken_];
  ++taken_;
  if (channel.step == 0) return true;
  if (sharedCount_ == 0) sharedCount_ = channel.count;
  return channel.count == sharedCount_;
}

void NodeChannels::FetchRuns() {
  if (fetchedSamples_ != 0) return;
  for (Channel& channel : channels_) {
    if (channel.count == 0) continue;
    const void* run = nullptr;
    ThrowOnError(RecordListGetRun(channel.keys, 0, channel.count, &run));
    if (run == nullptr) return;
    channel.run = static_cast<const MAYA_Key*>(run);
  }
  fetchedSamples_ = static_cast<std::uint32_t>(sharedCount_);
}

}  // namespace mayaimport
