#include "tools/mayascene/ImportCommand.h"

#include <unistd.h>

#include <memory>
#include <string>
#include <utility>

#include "tools/mayascene/CompositionJson.h"
#include "tools/mayascene/HostSession.h"
#include "tools/mayascene/Outline.h"
#include "tools/mayascene/OutputFile.h"
#include "tools/mayascene/Report.h"
#include "tools/mayascene/SceneFile.h"

namespace mayascene {
namespace {

// The outputs of a run; each is null where it was not asked for.
struct Outputs {
  std::unique_ptr<OutputFile> outline, json, trace;

  bool open(const ImportArguments& arguments, std::string* failure) {
    const bool outputTaken = arguments.json == kStandardOutput || arguments.host.trace == kStandardOutput;
    return openOne(arguments.quiet || outputTaken ? "" : kStandardOutput, &outline, failure) &&
           openOne(arguments.json, &json, failure) &&
           openOne(arguments.host.trace, &trace, failure, OutputFile::openLog);
  }

  static bool openOne(const std::string& target, std::unique_ptr<OutputFile>* output, std::string* failure,
                      decltype(&OutputFile::open) open = OutputFile::open) {
    if (target.empty()) return true;
    *output = open(target, failure);
    return *output != nullptr;
  }

  ExitStatus commit(Diagnostics& diagnostics) {
    ExitStatus status = ExitStatus::Done;
    for (OutputFile* output : {outline.get(), json.get(), trace.get()}) {
      std::string failure;
      if (output == nullptr || output->commit(&failure)) continue;
      diagnostics.complain("", failure);
      status = ExitStatus::CannotWrite;
    }
    return status;
  }
};

// The importer answers a file that is no Maya ASCII scene with a message and code 0, having made nothing. Two
// signs tell it from a scene without cameras, of which nothing is made either: the file does not begin as
// one, or the host showed a message (a file that changed, or could not be read, after the look).
Outcome outcomeOf(const SceneLook& look, const refhost::CallbackResult& result) {
  if (result.code != 0) return Outcome::Failed;
  if (result.folder != nullptr && !result.folder->compositions.empty()) return Outcome::Imported;
  return look.mayaHeader && result.messages.empty() ? Outcome::Nothing : Outcome::Refused;
}

SceneReport importOne(const std::string& path, HostSession& session, Diagnostics& diagnostics) {
  SceneReport report;
  report.path = path;
  const SceneLook look = lookAtScene(path);
  if (!look.readable) {
    diagnostics.complain(path, look.failure);
    return report;
  }
  report.result = session.host().importScene(path);
  report.outcome = outcomeOf(look, report.result);
  return report;
}

// What goes to standard error about one scene, and its status.
ExitStatus judgeScene(const SceneReport& report, bool outlinePrinted, Diagnostics& diagnostics) {
  if (report.outcome == Outcome::Unreadable) return ExitStatus::Unreadable;
  if (!outlinePrinted) diagnostics.messages(report.path, report.result);
  const ExitStatus status = diagnostics.judge(report.path, report.result);
  if (report.outcome != Outcome::Refused) return status;
  diagnostics.complain(report.path, "refused: it is no Maya ASCII scene");
  return ExitStatus::Refused;
}

ExitStatus importAll(const ImportArguments& arguments, HostSession& session, Outputs& outputs, RunReport* run,
                     Diagnostics& diagnostics) {
  ExitStatus status = ExitStatus::Done;
  const Style style(colourAllowed(STDOUT_FILENO));
  bool first = true;
  for (const std::string& path : arguments.scenes) {
    SceneReport report = importOne(path, session, diagnostics);
    if (outputs.outline && report.outcome != Outcome::Unreadable) {
      std::ostream& out = outputs.outline->stream();
      if (!std::exchange(first, false)) out << '\n';
      printOutline(out, report, style);
      out.flush();
    }
    report.status = judgeScene(report, outputs.outline != nullptr, diagnostics);
    status = worse(status, report.status);
    run->scenes.push_back(std::move(report));
  }
  return status;
}

}  // namespace

ExitStatus runImport(const ImportArguments& arguments, Diagnostics& diagnostics) {
  Outputs outputs;
  std::string failure;
  if (!outputs.open(arguments, &failure)) {
    diagnostics.complain("", failure);
    return ExitStatus::CannotWrite;
  }
  HostSession session(arguments.host, refhost::Callback::Import,
                      outputs.trace ? &outputs.trace->stream() : nullptr, diagnostics);
  RunReport run;
  ExitStatus status = session.start();
  const bool loaded = status <= ExitStatus::Refused;
  if (loaded) {
    run.linearUnits = session.host().linearUnits();
    run.entry = session.entry();
    status = worse(status, importAll(arguments, session, outputs, &run, diagnostics));
    status = worse(status, session.finish());
    run.deathHook = session.deathHook();
  }
  if (loaded && outputs.json) writeCompositionJson(outputs.json->stream(), run);
  if (!loaded) outputs.json.reset();  // what lay there stays
  return worse(status, outputs.commit(diagnostics));
}

}  // namespace mayascene
