// "QZGP Keyframe Suite" 3 and 4: keys, counted and added in batches.
#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <string>
#include <utility>

#include "refhost/Call.h"
#include "refhost/StreamTable.h"
#include "refhost/SuiteRegistry.h"

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

// The tasks of every key. Their refusals are in functions of their own, which keeps them small.
struct AddingKey {
  static constexpr Operation kOperation = Operation::AddBatchKeyframe;

  static HostError work(HostState& host, VOR_AddKeyframesInfo* batch, std::int32_t timeMode,
                        const T_Time* time, std::int32_t* index) {
    Batch* const open = host.batches.find(batch);
    if (open == nullptr) [[unlikely]]
      return refuseHandle(kOperation, batch, HandleKind::Batch, "the batch");
    if (time == nullptr) [[unlikely]]
      return refuseNull(kOperation, "the time");
    if (index == nullptr) [[unlikely]]
      return refuseNull(kOperation, "the place for the index");
    if (timeMode != HOST_TIME_MODE_COMP) [[unlikely]]
      return refuseTimeMode(timeMode);
    if (time->scale == 0 && !host.options.permissive) [[unlikely]]
      return refuseTime(time->value);
    if (host.allowance.keys == 0) [[unlikely]]
      return refuseKey(kOperation);
    if (!open->times.hasRoom(1)) [[unlikely]]
      return workWithMoreRoom(host, batch, timeMode, time, index);
    *index = static_cast<std::int32_t>(open->times.size());
    open->addKey(*time);
    --host.allowance.keys;
    return 0;
  }

  static void idle(Call& call, VOR_AddKeyframesInfo*, std::int32_t, const T_Time*, std::int32_t* index) {
    call.handOutNothing(index);
  }

  static void describe(TraceLine& line, VOR_AddKeyframesInfo* batch, std::int32_t timeMode,
                       const T_Time* time, std::int32_t* index) {
    line.handle("batch", batch).integer("timeMode", timeMode).time("time", time);
    line.handedInteger("index", index);
  }

 private:
  // Makes room for a key of the batch, which is open, and begins again.
  [[gnu::cold, gnu::noinline]] static HostError workWithMoreRoom(HostState& host, VOR_AddKeyframesInfo* batch,
                                                                 std::int32_t timeMode, const T_Time* time,
                                                                 std::int32_t* index) {
    host.batches.find(batch)->times.makeRoom(1);
    return work(host, batch, timeMode, time, index);
  }

  [[gnu::cold, gnu::noinline]] static HostError refuseTimeMode(std::int32_t timeMode) {
    return refuse(kOperation, HOST_ERR_BAD_TIME_MODE,
                  "the time mode " + std::to_string(timeMode) + " is not 0");
  }

  [[gnu::cold, gnu::noinline]] static HostError refuseTime(std::int32_t value) {
    return refuse(kOperation, HOST_ERR_BAD_TIME, "a key time of " + std::to_string(value) + "/0 has scale 0");
  }
};

struct SettingKey {
  static constexpr Operation kOperation = Operation::SetBatchKeyframeValue;

  static HostError work(HostState& host, VOR_AddKeyframesInfo* batch, std::int32_t index,
                        const StreamValueRecord* value) {
    Batch* const open = host.batches.find(batch);
    if (open == nullptr) [[unlikely]]
      return refuseHandle(kOperation, batch, HandleKind::Batch, "the batch");
    if (value == nullptr) [[unlikely]]
      return refuseNull(kOperation, "the value record");
    const HeldStream* const recorded = host.streams.find(value->stream);
    if (recorded == nullptr) [[unlikely]]
      return refuseHandle(kOperation, value->stream, HandleKind::Stream, "the record's stream");
    if (recorded->stream != open->stream) [[unlikely]]
      return refuseOtherStream(batch, value->stream);
    const auto key = static_cast<std::size_t>(index);  // a negative index is beyond every key
    if (key >= open->times.size()) [[unlikely]]
      return refuseIndex(batch, index);
    if (!host.takesValue(*value, open->stream->dimension)) [[unlikely]]
      return refuseNotFinite(kOperation, "the value");
    open->setValue(key, value->value);
    return 0;
  }

  static void idle(Call&, VOR_AddKeyframesInfo*, std::int32_t, const StreamValueRecord*) {}

  static void describe(TraceLine& line, VOR_AddKeyframesInfo* batch, std::int32_t index,
                       const StreamValueRecord* value) {
    line.handle("batch", batch).integer("index", index);
    line.handle("stream", value == nullptr ? nullptr : value->stream);
    line.recordValues("value", value);
  }

 private:
  [[gnu::cold, gnu::noinline]] static HostError refuseOtherStream(VOR_AddKeyframesInfo* batch,
                                                                  VOR_Stream* stream) {
    const HandleCodec& codec = HostState::live().codec;
    return refuse(
        kOperation, HOST_ERR_BATCH_KEY,
        codec.describe(stream) + " is not of the stream that " + codec.describe(batch) + " was opened on");
  }

  [[gnu::cold, gnu::noinline]] static HostError refuseIndex(VOR_AddKeyframesInfo* batch, std::int32_t index) {
    return refuse(
        kOperation, HOST_ERR_BATCH_KEY,
        HostState::live().codec.describe(batch) + " holds no key of the index " + std::to_string(index));
  }
};

// Keys that the stream does not keep no longer count against the limit.
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
  suite.AddBatchKeyframe = perform<AddingKey>;
  suite.EndKeyframeBatch = EndKeyframeBatch;
  return suite;
}

constexpr QZGP_KeyframeSuite4 table4() {
  QZGP_KeyframeSuite4 suite{};
  suite.SetBatchKeyframeValue = perform<SettingKey>;
  return suite;
}

}  // namespace

constinit const QZGP_KeyframeSuite3 kKeyframeSuite3 = table3();
constinit const QZGP_KeyframeSuite4 kKeyframeSuite4 = table4();

}  // namespace refhost
