#include "tests/secondreader/SceneRun.h"

#include <csignal>
#include <fstream>
#include <sstream>
#include <vector>

#include "plugin/Entry.h"
#include "plugin/Globals.h"
#include "tests/secondreader/FailurePlan.h"
#include "tests/secondreader/ProjectText.h"
#include "tests/secondreader/SceneGenerator.h"
#include "tests/secondreader/TraceComparison.h"
#include "tests/support/OwnProcess.h"

namespace secondreader {
namespace {

constexpr std::uint64_t kFailureSeeds = 0x5eed0000000000u;

// What the callbacks gave, and what they made.
struct Results {
  refhost::CallbackResult entry;
  refhost::CallbackResult verify;
  std::vector<refhost::CallbackResult> imports;
  refhost::CallbackResult death;
  std::string project;
};

// `trace` may be null: nobody watches the host then, and it takes its short ways.
Results runHost(refhost::HostOptions options, const std::string& path, int imports, std::ostream* trace) {
  options.trace = trace;
  G_use_linear_unitsL = 0;
  Results results;
  {
    refhost::Host host(std::move(options));
    host.load(&MayaImportEntry, &results.entry);
    results.verify = host.verifyScene(path);
    for (int i = 0; i < imports; ++i) results.imports.push_back(host.importScene(path));
    results.project = textOf(host.project());
    results.death = host.unload();
  }
  // What a death hook that could not be registered left.
  DeathHook(0);
  return results;
}

void compareTrace(std::ostringstream& words, const Prediction& prediction, std::string_view trace) {
  if (const auto difference = firstDifference(prediction.trace, linesOf(trace))) {
    words << "line " << difference->line << " of the trace:\n  predicted: " << difference->predicted
          << "\n  traced:    " << difference->traced << '\n';
  }
}

void compare(std::ostringstream& words, const char* callback, const PredictedCallback& predicted,
             const refhost::CallbackResult& result) {
  if (predicted.code != result.code) {
    words << callback << ": code predicted " << predicted.code << ", returned " << result.code << '\n';
  }
  if (predicted.canImport != result.canImport) words << callback << ": the answers differ\n";
  if (predicted.messages != result.messages) {
    words << callback << ": messages differ\n";
    for (const std::string& message : predicted.messages) words << "  predicted: " << message << '\n';
    for (const std::string& message : result.messages) words << "  shown:     " << message << '\n';
  }
  for (const std::string& refusal : result.refusals) {
    if (refusal == "an exception left the plug-in") words << callback << ": " << refusal << '\n';
  }
  for (const refhost::Leftover& leftover : result.leftovers) {
    if (!leftover.keptByDesign) words << callback << ": left behind: " << leftover.description << '\n';
  }
}

std::vector<std::string> describe(const std::vector<refhost::Leftover>& leftovers) {
  std::vector<std::string> words;
  for (const refhost::Leftover& leftover : leftovers) words.push_back(leftover.description);
  return words;
}

void compareUnwatched(std::ostringstream& words, const char* callback, const refhost::CallbackResult& watched,
                      const refhost::CallbackResult& unwatched) {
  const bool same = watched.code == unwatched.code && watched.line == unwatched.line &&
                    watched.canImport == unwatched.canImport && watched.messages == unwatched.messages &&
                    watched.refusals == unwatched.refusals && watched.suiteCalls == unwatched.suiteCalls &&
                    describe(watched.leftovers) == describe(unwatched.leftovers);
  if (!same) words << callback << ": another result when nobody watches the host\n";
}

void compareUnwatched(std::ostringstream& words, const Results& watched, const Results& unwatched) {
  compareUnwatched(words, "entry", watched.entry, unwatched.entry);
  compareUnwatched(words, "verify", watched.verify, unwatched.verify);
  for (std::size_t i = 0; i < watched.imports.size(); ++i) {
    compareUnwatched(words, "import", watched.imports[i], unwatched.imports[i]);
  }
  compareUnwatched(words, "death", watched.death, unwatched.death);
  if (watched.project != unwatched.project) {
    words << "another project when nobody watches the host\nwatched:\n"
          << watched.project << "unwatched:\n"
          << unwatched.project;
  }
}

std::string describe(const refhost::HostOptions& options) {
  std::ostringstream words;
  for (const refhost::RefusedSuite& refused : options.refusedSuites) {
    words << " refused: " << refused.name << ' ' << refused.version << ';';
  }
  for (const refhost::Failure& failure : options.failures) {
    words << ' ' << (failure.operation.empty() ? "call" : failure.operation) << ':' << failure.nth
          << (failure.onwards ? "+" : "") << '=';
    if (failure.kind == refhost::Failure::Kind::Code) {
      words << failure.code;
    } else {
      words << wordOf(failure.kind);
    }
    words << ';';
  }
  return words.str();
}

void compareReturn(std::ostringstream& words, const Prediction& prediction,
                   const refhost::HostOptions& options, const std::string& path, int imports) {
  std::ostringstream trace;
  const Results results = runHost(options, path, imports, &trace);
  compareTrace(words, prediction, trace.str());
  compare(words, "entry", prediction.entry, results.entry);
  compare(words, "verify", prediction.verify, results.verify);
  for (std::size_t i = 0; i < results.imports.size(); ++i) {
    compare(words, "import", prediction.imports[i], results.imports[i]);
  }
  compare(words, "death", prediction.death, results.death);
  compareUnwatched(words, results, runHost(options, path, imports, nullptr));
}

void compareEnd(std::ostringstream& words, const Prediction& prediction, const refhost::HostOptions& options,
                const std::string& path, int imports, const testsupport::TemporaryFolder& folder) {
  constexpr const char* kTraceName = "trace of a process that ends";
  const auto expectAborted = [&words](const char* which, int signal) {
    if (signal == SIGABRT) return;
    words << which << ": the process was to end, and ";
    if (signal == 0) {
      words << "the callbacks returned\n";
    } else {
      words << "signal " << signal << " ended it\n";
    }
  };
  expectAborted("watched", testsupport::SignalOfOwnProcess([&] {
                  std::ofstream trace;
                  // What is still in a buffer would be lost.
                  trace.rdbuf()->pubsetbuf(nullptr, 0);
                  trace.open(folder.path() / kTraceName, std::ios::binary);
                  runHost(options, path, imports, &trace);
                }));
  compareTrace(words, prediction, folder.read(kTraceName));
  expectAborted("unwatched",
                testsupport::SignalOfOwnProcess([&] { runHost(options, path, imports, nullptr); }));
}

}  // namespace

RunReport SceneRunner::run(const refhost::HostOptions& options, const std::string& fileName,
                           std::string_view scene, int imports) {
  RunReport report;
  const std::string path = (folder_.path() / fileName).string();
  report.prediction = predict(options, path, scene, imports);
  folder_.write(fileName, scene);
  std::ostringstream words;
  if (report.prediction.processEnds) {
    compareEnd(words, report.prediction, options, path, imports, folder_);
  } else {
    compareReturn(words, report.prediction, options, path, imports);
  }
  if (!words.str().empty()) report.disagreement = words.str();
  return report;
}

SeedReport runSeed(SceneRunner& runner, std::uint64_t seed, bool failures) {
  SeedReport report;
  GeneratedScene scene = SceneGenerator(seed).make();
  const auto runOnce = [&] {
    const RunReport run = runner.run(scene.options, scene.fileName, scene.bytes, scene.imports);
    report.runs += 1;
    report.ended += run.prediction.processEnds ? 1 : 0;
    report.imported += !run.prediction.processEnds && run.prediction.imports.front().code == 0 ? 1 : 0;
    report.lines += run.prediction.trace.size();
    if (run.disagreement) {
      report.disagreement = "scene " + std::to_string(seed) + ", rehearsing:" + describe(scene.options) +
                            "\n" + *run.disagreement;
    }
    return run.prediction.imports.front();
  };
  const PredictedCallback plain = runOnce();
  if (!failures || report.disagreement) return report;
  planFailures(seed ^ kFailureSeeds, {plain.suiteCalls, plain.numberScans}, &scene.options);
  runOnce();
  return report;
}

}  // namespace secondreader
