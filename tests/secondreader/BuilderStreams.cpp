// Values and keys on streams: each stream acquired for one use, and given back.
#include "tests/secondreader/Builder.h"
#include "tests/secondreader/BuilderTemplates.h"

namespace secondreader {

void Builder::setStream(Handle layer, std::int32_t id, const SuiteUser::Value& value) {
  withStream(layer, id, [&](Handle stream) { check(suites_.setStreamValue(stream, value)); });
}

// The camera's own two streams: after a failure the handle is kept.
void Builder::setStreamUnguarded(Handle layer, std::int32_t id, const SuiteUser::Value& value) {
  Handle stream = 0;
  check(suites_.acquireLayerStream(layer, id, &stream));
  suites_.host().excuse(stream);
  check(suites_.setStreamValue(stream, value));
  check(suites_.releaseStream(stream));
}

void Builder::openBatch(Handle layer, Batch& batch) {
  withStream(layer, batch.stream,
             [&](Handle stream) { check(suites_.beginKeyframeBatch(stream, &batch.number)); });
}

void Builder::insertKey(Handle layer, const Batch& batch, T_Time time, const SuiteUser::Value& value) {
  withStream(layer, batch.stream, [&](Handle stream) {
    std::int32_t index = 0;
    check(suites_.addBatchKeyframe(batch.number, time, &index));
    check(suites_.setBatchKeyframeValue(batch.number, index, stream, value));
  });
}

// All of them, whatever happens to one; the first exception goes on.
void Builder::closeBatches(const std::vector<Batch>& batches) {
  HostError kept = HOST_ERR_NONE;
  for (const Batch& batch : batches) {
    if (batch.number == 0) continue;
    const HostError code = suites_.host().guarded([&] { suites_.endKeyframeBatch(batch.number); });
    if (kept == HOST_ERR_NONE) kept = code;
  }
  check(kept);
}

}  // namespace secondreader
