// The skippers of text over meshes, beside a count of the words of the same text, which is about the least
// that reading every byte costs. The counter "of_count" is a skipper's speed as a share of the count's; the
// two take turns. One text fits the processor's caches, one does not.
#include <time.h>

#include <chrono>

#include "bench/WordCount.h"
#include "bench/micro/MicroBenchmark.h"
#include "scan/FindEnd.h"
#include "scan/SkipText.h"

namespace bench {
namespace {

using Seconds = std::chrono::duration<double>;

// The thread's own time, which does not run while others have the processor.
Seconds now() {
  timespec time{};
  clock_gettime(CLOCK_THREAD_CPUTIME_ID, &time);
  return std::chrono::seconds(time.tv_sec) + std::chrono::nanoseconds(time.tv_nsec);
}

constexpr double kScale = 0.2;
constexpr std::size_t kInCaches = 256 * 1024;  // bytes

// Skips to the end, over what stops it too: strings, and whatever else as a word. Returns how often it
// stopped.
std::int64_t skipAll(const std::string& text, scan::SkipText skip) {
  const char* const end = text.data() + text.size();
  std::int64_t stops = 0;
  std::int32_t lines = 0;
  for (const char* at = text.data(); at < end; ++stops) {
    at = skip(at, end, &lines);
    if (at == end) break;
    at = *at == '"' ? scan::FindQuote(at + 1, end) + 1 : scan::FindWordEnd(at + 1, end);
  }
  benchmark::DoNotOptimize(lines);
  return stops;
}

void skipText(benchmark::State& state, const std::string& text, scan::SkipText skip) {
  Seconds counting{};
  Seconds skipping{};
  std::int64_t stops = 0;
  for (auto _ : state) {
    const Seconds begin = now();
    benchmark::DoNotOptimize(countWords(text.data(), text.size()));
    const Seconds between = now();
    stops = skipAll(text, skip);
    const Seconds end = now();
    counting += between - begin;
    skipping += end - between;
    state.SetIterationTime((end - between).count());
  }
  countWork(state, stops, static_cast<std::int64_t>(text.size()));
  state.counters["of_count"] = counting / skipping;
}

const bool registered = [] {
  static const std::string inMemory = sceneOf("mesh", kScale);
  static const std::string inCaches = inMemory.substr(inMemory.size() / 2, kInCaches);
  for (const scan::TextSkipper& skipper : scan::TextSkippers()) {
    for (const auto& [place, text] : {std::pair<const char*, const std::string&>{"caches", inCaches},
                                      std::pair<const char*, const std::string&>{"memory", inMemory}}) {
      const std::string name = std::string("skip/mesh_in_") + place + "/" + skipper.name;
      benchmark::RegisterBenchmark(name.c_str(), skipText, text, skipper.betweenCommands)->UseManualTime();
    }
  }
  return true;
}();

}  // namespace
}  // namespace bench
