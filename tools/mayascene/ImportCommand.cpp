#include "tools/mayascene/ImportCommand.h"

#include <unistd.h>

#include <memory>
#include <optional>
#include <string>
#include <utility>

#include "tools/mayascene/BakeReportJson.h"
#include "tools/mayascene/ClosingLine.h"
#include "tools/mayascene/CompositionJson.h"
#include "tools/mayascene/HostSession.h"
#include "tools/mayascene/Outline.h"
#include "tools/mayascene/OutputFile.h"
#include "tools/mayascene/Report.h"
#include "tools/mayascene/SceneImport.h"

namespace mayascene {
namespace {

// The outputs of a run; each is null where it was not asked for.
struct Outputs {
  std::unique_ptr<OutputFile> outline, json, trace, report;

  bool open(const ImportArguments& arguments, std::string* failure) {
    const bool outputTaken = arguments.json == kStandardOutput || arguments.host.trace == kStandardOutput;
    return openOne(arguments.quiet || outputTaken ? "" : kStandardOutput, &outline, failure) &&
           openOne(arguments.json, &json, failure) &&
           openOne(arguments.bake ? arguments.bake->report : "", &report, failure) &&
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
    for (OutputFile* output : {outline.get(), json.get(), trace.get(), report.get()}) {
      std::string failure;
      if (output == nullptr || output->commit(&failure)) continue;
      diagnostics.complain("", failure);
      status = ExitStatus::CannotWrite;
    }
    return status;
  }
};

// A plain import has to read the scene once more for them. A bake has read it already.
std::optional<SceneNumbers> numbersOf(const SceneReport& report, const BakedScene* baked) {
  const refhost::Folder* const folder = report.result.folder;
  if (folder == nullptr || folder->compositions.empty()) return std::nullopt;
  if (baked != nullptr) return mayascene::numbersOf(*baked);
  return mayascene::numbersOf(report.path, *folder->compositions.front());
}

ExitStatus importAll(const ImportArguments& arguments, HostSession& session, Outputs& outputs, RunReport* run,
                     Diagnostics& diagnostics) {
  ExitStatus status = ExitStatus::Done;
  const Style style(colourAllowed(STDOUT_FILENO));
  bool first = true;
  for (const std::string& path : arguments.scenes) {
    SceneReport report;
    if (arguments.bake) {
      report = importBaked(path, *arguments.bake, session, diagnostics, &run->bakes.emplace_back());
    } else {
      report = importOne(path, session, diagnostics);
    }
    if (outputs.outline && report.outcome != Outcome::Unreadable && !report.explained) {
      std::ostream& out = outputs.outline->stream();
      if (!std::exchange(first, false)) out << '\n';
      printOutline(out, report, arguments.verbose ? Detail::Properties : Detail::Layers, style);
      out.flush();
    }
    if (outputs.json) report.numbers = numbersOf(report, arguments.bake ? &run->bakes.back() : nullptr);
    const ExitStatus bakeStatus = arguments.bake ? report.status : ExitStatus::Done;
    report.status = worse(bakeStatus, judgeScene(report, outputs.outline != nullptr, diagnostics));
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
  if (!loaded) {  // existing files stay
    outputs.json.reset();
    outputs.report.reset();
  }
  if (outputs.json) writeCompositionJson(outputs.json->stream(), run);
  if (outputs.report) writeBakeReport(outputs.report->stream(), run.bakes);
  status = worse(status, outputs.commit(diagnostics));
  // Last, after all outputs are written.
  if (arguments.bake) return status;
  for (const SceneReport& scene : run.scenes) (void)closeWithLoss(scene, arguments.quiet, {}, diagnostics);
  return status;
}

}  // namespace mayascene
