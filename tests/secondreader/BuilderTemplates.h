// The two guarded sections of the builder.
#pragma once

#include <utility>
#include <vector>

#include "tests/secondreader/Builder.h"

namespace secondreader {

// Runs work(stream) and then gives the stream back, also where the work throws.
template <typename Work>
void Builder::withStream(Handle layer, std::int32_t id, Work work) {
  Handle stream = 0;
  check(suites_.acquireLayerStream(layer, id, &stream));
  HostError kept = HOST_ERR_NONE;
  try {
    kept = suites_.host().guarded([&] { work(stream); });
  } catch (const UnknownException&) {
    if (stream != 0) suites_.host().atBorder([&] { suites_.releaseStream(stream); });
    throw;
  }
  if (stream != 0) suites_.releaseStream(stream);
  check(kept);
}

// Opens the batches in their order, runs work(batches), and closes those that were opened.
template <typename Work>
void Builder::withBatches(Handle layer, std::vector<Batch> batches, Work work) {
  HostError kept = suites_.host().guarded([&] {
    for (Batch& batch : batches) openBatch(layer, batch);
    work(batches);
  });
  const HostError closing = suites_.host().guarded([&] { closeBatches(batches); });
  if (kept == HOST_ERR_NONE) kept = closing;
  check(kept);
}

}  // namespace secondreader
