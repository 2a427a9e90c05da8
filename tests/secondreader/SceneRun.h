// Runs a scene through the importer under the embedded host, and compares the result with the prediction.
// Where the process is to end, the run has a process of its own, which must end by SIGABRT and leave the
// predicted trace.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include "refhost/Host.h"
#include "tests/secondreader/SecondReader.h"
#include "tests/support/TemporaryFolder.h"

namespace secondreader {

struct RunReport {
  Prediction prediction;
  std::optional<std::string> disagreement;  // in words
};

class SceneRunner {
 public:
  RunReport run(const refhost::HostOptions& options, const std::string& fileName, std::string_view scene,
                int imports = 1) {
    return run(options, options, fileName, scene, imports);
  }

  // The prediction is made with options of its own, which say otherwise what is to fail.
  RunReport run(const refhost::HostOptions& options, const refhost::HostOptions& predicted,
                const std::string& fileName, std::string_view scene, int imports = 1);

 private:
  testsupport::TemporaryFolder folder_;
};

// The generated scene of a seed, run without failures and, if they are asked for, once more with failures.
struct SeedReport {
  int runs = 0;
  int ended = 0;                            // runs that ended their process, as predicted
  int imported = 0;                         // runs that returned, whose first import gave 0
  std::uint64_t lines = 0;                  // of all predicted traces
  std::optional<std::string> disagreement;  // names the seed
};
SeedReport runSeed(SceneRunner& runner, std::uint64_t seed, bool failures);

}  // namespace secondreader
