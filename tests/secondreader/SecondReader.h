// A second reader of scenes: slow and plain, it predicts the calls of the plug-in under the embedded host.
#pragma once

#include <cstdint>
#include <map>
#include <string>
#include <string_view>
#include <vector>

#include "refhost/Host.h"
#include "tests/secondreader/TraceComparison.h"

namespace secondreader {

// The predicted result of a callback.
struct PredictedCallback {
  HostError code = 0;
  bool canImport = false;
  std::vector<std::string> messages;
  std::vector<std::string> leftBehind;  // by handle; empty but for an exception of an unknown type
  std::size_t leftovers = 0;            // on the ledger, with those that are kept by design
  int suiteCalls = 0;
  std::map<std::string, std::int64_t> counts;  // by call and service; only in the callback of the rehearsal
};

// The predicted state after all callbacks.
struct Made {
  std::string importerName;
  std::size_t extensions = 0;
  std::size_t compositions = 0;
  std::size_t layers = 0;
  std::size_t keys = 0;
  std::int32_t linearUnits = 0;
  bool stringTable = false;  // after the death hook

  bool operator==(const Made&) const = default;
};

// The callbacks in their order: the entry, the header test, the imports, the death hook.
struct Prediction {
  std::vector<PredictedLine> trace;
  PredictedCallback entry;
  PredictedCallback verify;
  std::vector<PredictedCallback> imports;
  PredictedCallback death;
  Made made;
  bool processEnds = false;  // in one of them; then nothing else is predicted
};

// The options are those that the host is made with; `scene` is what the file of that path holds, and it is
// imported so many times. The path is UTF-8.
Prediction predict(const refhost::HostOptions& options, const std::string& path, std::string_view scene,
                   int imports = 1);

}  // namespace secondreader
