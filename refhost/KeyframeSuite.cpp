// "QZGP Keyframe Suite" 3 and 4: keys, counted and added in batches.
#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <string>
#include <utility>

#include "refhost/Call.h"
#include "refhost/StreamTable.h"
#include "refhost/SuiteShelf.h"

namespace refhost {
namespace {

constexpr std::size_t kMostKeys = INT32_MAX;

HostError GetStreamKeyframeCount(VOR_Stream* stream, std::int32_t* count) {
  Call call(Operation::GetStreamKeyframeCount);
  if (call.goesOn(count)) {
    HeldStream* held = call.stream(stream);
    if (held != nullptr && call.given(count, "the place for the count")) {
      *count = static_cast<std::int32_t>(std::min(held->stream->keyCount(), kMostKeys));
      held->heldKeys = *count > 0;
    }
  }
  if (TraceLine* line = call.traced()) line->handle("stream", stream).handedInteger("count", count);
  return call.finish();
}

void beginKeyframeBatch(Call& call, VOR_Stream* stream, VOR_AddKeyframesInfo** batch) {
  const HeldStream* held = call.stream(stream);
  if (held == nullptr || !call.given(batch, "the place for the batch")) return;
  HostState& host = call.host();
  if (host.batches.any([&](const Batch& open) { return open.stream == held->stream; })) {
    call.refuse(HOST_ERR_BATCH_OPEN, "the " + std::string(streamName(held->stream->id, held->layer->kind)) +
                                         " of layer:" + std::to_string(held->layer->number) +
                                         " already has an open batch");
    return;
  }
  void* handle = nullptr;
  Batch* opened = host.batches.add(&handle);
  if (opened == nullptr) {
    call.refuse(HOST_ERR_MEMORY, "too many batches are open");
    return;
  }
  opened->layer = held->layer;
  opened->stream = held->stream;
  *batch = static_cast<VOR_AddKeyframesInfo*>(handle);
}

HostError BeginKeyframeBatch(VOR_Stream* stream, VOR_AddKeyframesInfo** batch) {
  Call call(Operation::BeginKeyframeBatch);
  if (call.goesOn(batch)) beginKeyframeBatch(call, stream, batch);
  if (TraceLine* line = call.traced()) line->handle("stream", stream).handed("batch", batch);
  return call.finish();
}

// The sentences of the operations that are called for every key are put together apart from them.
[[gnu::cold, gnu::noinline]] void refuseTimeMode(Call& call, std::int32_t timeMode) {
  call.refuse(HOST_ERR_BAD_TIME_MODE, "the time mode " + std::to_string(timeMode) + " is not 0");
}

[[gnu::cold, gnu::noinline]] void refuseTime(Call& call, const T_Time& time) {
  call.refuse(HOST_ERR_BAD_TIME, "a key time of " + std::to_string(time.value) + "/0 has scale 0");
}

[[gnu::cold, gnu::noinline]] void refuseOtherStream(Call& call, VOR_AddKeyframesInfo* batch,
                                                    VOR_Stream* stream) {
  const HandleCodec& codec = call.host().codec;
  call.refuse(HOST_ERR_BATCH_KEY, codec.describe(stream) + " is not of the stream that " +
                                      codec.describe(batch) + " was opened on");
}

[[gnu::cold, gnu::noinline]] void refuseIndex(Call& call, VOR_AddKeyframesInfo* batch, std::int32_t index) {
  call.refuse(HOST_ERR_BATCH_KEY,
              call.host().codec.describe(batch) + " holds no key of the index " + std::to_string(index));
}

void addBatchKeyframe(Call& call, VOR_AddKeyframesInfo* batch, std::int32_t timeMode, const T_Time* time,
                      std::int32_t* index) {
  Batch* open = call.batch(batch);
  if (open == nullptr || !call.given(time, "the time") || !call.given(index, "the place for the index"))
    return;
  if (timeMode != HOST_TIME_MODE_COMP) return refuseTimeMode(call, timeMode);
  if (time->scale == 0 && !call.host().options.permissive) return refuseTime(call, *time);
  if (call.host().allowance.keys == 0) return refuseKey(call);
  *index = static_cast<std::int32_t>(open->times.size());
  open->addKey(*time);
  --call.host().allowance.keys;
}

[[gnu::noinline]] HostError addBatchKeyframeWatched(VOR_AddKeyframesInfo* batch, std::int32_t timeMode,
                                                    const T_Time* time, std::int32_t* index) {
  Call call(Operation::AddBatchKeyframe);
  if (call.goesOn(index)) addBatchKeyframe(call, batch, timeMode, time, index);
  if (TraceLine* line = call.traced()) {
    line->handle("batch", batch).integer("timeMode", timeMode).time("time", time);
    line->handedInteger("index", index);
  }
  return call.finish();
}

// The ordinary call, kept short because an import makes it for every key of every stream: nobody watches, and
// there is nothing to refuse. Every other call goes the long way.
HostError AddBatchKeyframe(VOR_AddKeyframesInfo* batch, std::int32_t timeMode, const T_Time* time,
                           std::int32_t* index) {
  HostState& host = HostState::live();
  Batch* const open = host.batches.find(batch);
  if (!host.watched() && open != nullptr && timeMode == HOST_TIME_MODE_COMP && time != nullptr &&
      time->scale != 0 && index != nullptr && host.allowance.keys != 0 && open->hasRoomForKey()) [[likely]] {
    host.rehearsal.count(Operation::AddBatchKeyframe);
    *index = static_cast<std::int32_t>(open->times.size());
    open->addKeyInRoom(*time);
    --host.allowance.keys;
    return 0;
  }
  return addBatchKeyframeWatched(batch, timeMode, time, index);
}

void setBatchKeyframeValue(Call& call, VOR_AddKeyframesInfo* batch, std::int32_t index,
                           const StreamValueRecord* value) {
  Batch* open = call.batch(batch);
  if (open == nullptr || !call.given(value, "the value record")) return;
  const HeldStream* recorded = call.stream(value->stream, "the record's stream");
  if (recorded == nullptr) return;
  if (recorded->stream != open->stream) return refuseOtherStream(call, batch, value->stream);
  if (index < 0 || static_cast<std::size_t>(index) >= open->times.size())
    return refuseIndex(call, batch, index);
  if (!call.areFinite(value->value, open->stream->dimension, "the value")) return;
  open->setValue(static_cast<std::size_t>(index), value->value);
}

[[gnu::noinline]] HostError setBatchKeyframeValueWatched(VOR_AddKeyframesInfo* batch, std::int32_t index,
                                                         const StreamValueRecord* value) {
  Call call(Operation::SetBatchKeyframeValue);
  if (call.goesOn()) setBatchKeyframeValue(call, batch, index, value);
  if (TraceLine* line = call.traced()) {
    line->handle("batch", batch).integer("index", index);
    line->handle("stream", value == nullptr ? nullptr : value->stream);
    line->recordValues("value", value);
  }
  return call.finish();
}

// As short as AddBatchKeyframe.
HostError SetBatchKeyframeValue(VOR_AddKeyframesInfo* batch, std::int32_t index,
                                const StreamValueRecord* value) {
  HostState& host = HostState::live();
  Batch* const open = host.batches.find(batch);
  if (!host.watched() && open != nullptr && value != nullptr) [[likely]] {
    const HeldStream* const recorded = host.streams.find(value->stream);
    if (recorded != nullptr && recorded->stream == open->stream && open->canAddValueOf(index, value->value))
        [[likely]] {
      host.rehearsal.count(Operation::SetBatchKeyframeValue);
      open->addValueInRoom(value->value);
      return 0;
    }
  }
  return setBatchKeyframeValueWatched(batch, index, value);
}

// Keys that the stream does not keep are no longer the host's.
void endBatch(HostState& host, Batch& batch, bool commit) {
  const std::size_t held = batch.stream->keyCount() + batch.times.size();
  if (commit) host.editor.commit(batch);
  host.allowance.keys += static_cast<std::int64_t>(held - batch.stream->keyCount());
}

HostError EndKeyframeBatch(std::int32_t commit, VOR_AddKeyframesInfo* batch) {
  Call call(Operation::EndKeyframeBatch);
  if (call.goesOn()) {
    if (Batch* open = call.batch(batch)) {
      endBatch(call.host(), *open, commit != 0);
      call.host().batches.remove(batch);
    }
  } else if (Batch* open = call.host().batches.find(batch)) {
    open->endFailed = true;
  }
  if (TraceLine* line = call.traced()) line->integer("commit", commit).handle("batch", batch);
  return call.finish();
}

constexpr QZGP_KeyframeSuite3 table3() {
  QZGP_KeyframeSuite3 suite{};
  suite.GetStreamKeyframeCount = GetStreamKeyframeCount;
  suite.BeginKeyframeBatch = BeginKeyframeBatch;
  suite.AddBatchKeyframe = AddBatchKeyframe;
  suite.EndKeyframeBatch = EndKeyframeBatch;
  return suite;
}

constexpr QZGP_KeyframeSuite4 table4() {
  QZGP_KeyframeSuite4 suite{};
  suite.SetBatchKeyframeValue = SetBatchKeyframeValue;
  return suite;
}

}  // namespace

constinit const QZGP_KeyframeSuite3 kKeyframeSuite3 = table3();
constinit const QZGP_KeyframeSuite4 kKeyframeSuite4 = table4();

}  // namespace refhost
