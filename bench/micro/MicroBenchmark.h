// The helpers of the micro-benchmarks.
#pragma once

#include <benchmark/benchmark.h>

#include <cstdint>
#include <cstdlib>
#include <sstream>
#include <string>
#include <string_view>

#include "bench/SceneGenerator.h"

namespace bench {

// A workload's scene, at a fraction of its size.
inline std::string sceneOf(std::string_view workload, double scale) {
  constexpr std::uint64_t kSeed = 20240229;
  std::ostringstream out;
  findWorkload(workload)->write(out, scale, kSeed);
  return std::move(out).str();
}

// Reports the work of each iteration, as items and bytes per second.
inline void countWork(benchmark::State& state, std::int64_t items, std::int64_t bytes) {
  state.SetItemsProcessed(static_cast<std::int64_t>(state.iterations()) * items);
  state.SetBytesProcessed(static_cast<std::int64_t>(state.iterations()) * bytes);
}

// Ends the process where something failed: its time would mean nothing.
inline void require(bool success) {
  if (!success) std::abort();
}

}  // namespace bench
