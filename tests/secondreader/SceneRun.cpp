#include "tests/secondreader/SceneRun.h"

#include <csignal>
#include <fstream>
#include <sstream>
#include <vector>

#include "plugin/Entry.h"
#include "plugin/Globals.h"
#include "tests/secondreader/FailurePlan.h"
#include "tests/secondreader/SceneGenerator.h"
#include "tests/secondreader/TraceComparison.h"
#include "tests/support/OwnProcess.h"

using namespace mayaimport;

namespace secondreader {
namespace {

constexpr std::uint64_t kFailureSeeds = 0x5eed0000000000u;

// What the callbacks gave, and what they made.
struct Results {
  refhost::CallbackResult entry;
  refhost::CallbackResult verify;
  std::vector<refhost::CallbackResult> imports;
  refhost::CallbackResult death;
  Made made;
};

Made madeBy(const refhost::Host& host) {
  const refhost::Project& project = host.project();
  Made made{host.importerName(), host.importerExtensions().size(), project.compositions().size(),
            project.layers().size()};
  for (const refhost::Layer& layer : project.layers()) {
    for (const refhost::Stream& stream : layer.streams) made.keys += stream.keyCount();
  }
  made.linearUnits = G_use_linear_unitsL;
  return made;
}

Results runHost(refhost::HostOptions options, const std::string& path, int imports, std::ostream& trace) {
  options.trace = &trace;
  G_use_linear_unitsL = 0;
  Results results;
  {
    refhost::Host host(std::move(options));
    host.load(&MayaImportEntry, &results.entry);
    results.verify = host.verifyScene(path);
    for (int i = 0; i < imports; ++i) results.imports.push_back(host.importScene(path));
    results.made = madeBy(host);
    results.death = host.unload();
    results.made.stringTable = Maya_Import_G_zref != nullptr;
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
  if (predicted.leftovers != result.leftovers.size()) {
    words << callback << ": " << predicted.leftovers << " leftovers predicted, found "
          << result.leftovers.size() << '\n';
  }
  std::vector<std::string> leftBehind;
  for (const refhost::Leftover& leftover : result.leftovers) {
    if (leftover.keptByDesign) continue;
    leftBehind.push_back(leftover.description.substr(0, leftover.description.find(' ')));
  }
  if (predicted.leftBehind == leftBehind) return;
  for (const std::string& held : predicted.leftBehind)
    words << callback << ": predicted left: " << held << '\n';
  for (const std::string& held : leftBehind) words << callback << ": left behind: " << held << '\n';
}

void compareMade(std::ostringstream& words, const Made& predicted, const Made& made) {
  if (predicted == made) return;
  for (const auto& [what, each] : {std::pair{"predicted", &predicted}, std::pair{"found", &made}}) {
    words << what << ": importer \"" << each->importerName << "\" with " << each->extensions
          << " extensions, " << each->compositions << " compositions, " << each->layers << " layers, "
          << each->keys << " keys, units " << each->linearUnits
          << (each->stringTable ? ", a table of strings" : "") << '\n';
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
  const Results results = runHost(options, path, imports, trace);
  compareTrace(words, prediction, trace.str());
  compare(words, "entry", prediction.entry, results.entry);
  compare(words, "verify", prediction.verify, results.verify);
  for (std::size_t i = 0; i < results.imports.size(); ++i) {
    compare(words, "import", prediction.imports[i], results.imports[i]);
  }
  compare(words, "death", prediction.death, results.death);
  Made made = results.made;
  if (options.permissive) made.keys = prediction.made.keys;  // times may be no numbers
  compareMade(words, prediction.made, made);
}

void compareEnd(std::ostringstream& words, const Prediction& prediction, const refhost::HostOptions& options,
                const std::string& path, int imports, const testsupport::TemporaryFolder& folder) {
  constexpr const char* kTraceName = "trace of a process that ends";
  const int signal = testsupport::SignalOfOwnProcess([&] {
    std::ofstream trace;
    // What is still in a buffer would be lost.
    trace.rdbuf()->pubsetbuf(nullptr, 0);
    trace.open(folder.path() / kTraceName, std::ios::binary);
    runHost(options, path, imports, trace);
  });
  if (signal == 0) {
    words << "the process was to end, and the callbacks returned\n";
  } else if (signal != SIGABRT) {
    words << "the process was to end by an abort, and signal " << signal << " ended it\n";
  }
  compareTrace(words, prediction, folder.read(kTraceName));
}

}  // namespace

RunReport SceneRunner::run(const refhost::HostOptions& options, const refhost::HostOptions& predicted,
                           const std::string& fileName, std::string_view scene, int imports) {
  RunReport report;
  const std::string path = (folder_.path() / fileName).string();
  report.prediction = predict(predicted, path, scene, imports);
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
  PredictedCallback plain = runOnce();
  if (!failures || report.disagreement) return report;
  planFailures(seed ^ kFailureSeeds, {plain.suiteCalls, static_cast<int>(plain.counts["NumberScan"])},
               &scene.options);
  runOnce();
  return report;
}

}  // namespace secondreader
