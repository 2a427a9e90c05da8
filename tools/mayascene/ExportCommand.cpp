#include "tools/mayascene/ExportCommand.h"

#include <filesystem>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "text/Letters.h"
#include "tools/mayascene/BakeOutputs.h"
#include "tools/mayascene/BakeReportJson.h"
#include "tools/mayascene/ClosingLine.h"
#include "tools/mayascene/ExportOutputs.h"
#include "tools/mayascene/ExportScene.h"
#include "tools/mayascene/HostSession.h"
#include "tools/mayascene/SceneImport.h"

namespace mayascene {
namespace {

namespace fs = std::filesystem;

constexpr int kShownPerCode = 3;

// The first few of each code, and the number of the rest.
void show(const std::string& path, const diag::Collector& collector, Diagnostics& diagnostics) {
  std::map<diag::Code, int> shown;
  std::uint64_t left = collector.count();
  for (const diag::Diagnostic& one : collector.kept()) {
    if (++shown[one.code] > kShownPerCode) continue;
    diagnostics.show(path, one);
    --left;
  }
  if (left != 0) diagnostics.remark(path, std::to_string(left) + " more of these");
}

class ExportRun {
 public:
  ExportRun(const ExportArguments& arguments, const interchange::Format& format, Diagnostics& diagnostics)
      : arguments_(arguments), format_(format), diagnostics_(diagnostics) {
    for (const std::string& scene : arguments.scenes) taken_.untouchable.add(scene);
    if (arguments.bake && !arguments.bake->report.empty()) taken_.untouchable.add(arguments.bake->report);
  }

  // The outputs that have their names already.
  void take(const std::vector<std::string>& places) {
    for (const std::string& place : places) {
      taken_.outputs.insert(text::Lowered(fs::path(place).lexically_normal().string()));
    }
  }

  // Each scene has a host of its own, so that no two projects are held at a time.
  ExitStatus exportScene(const std::string& path, const std::string& place) {
    HostSession session(arguments_.host, refhost::Callback::Import, nullptr, diagnostics_);
    ExitStatus status = session.start();
    if (status > ExitStatus::Refused) return status;
    SceneReport report;
    const BakedScene* baked = nullptr;
    if (arguments_.bake) {
      report = importBaked(path, *arguments_.bake, session, diagnostics_, &bakes_.emplace_back());
      baked = &bakes_.back();
      status = worse(status, report.status);
    } else {
      report = importOne(path, session, diagnostics_);
    }
    status = worse(status, judgeScene(report, false, diagnostics_));
    const bool imported = report.outcome == Outcome::Imported;
    // An import makes a composition without layers where a default camera is the only one.
    if (imported && !report.result.folder->compositions.front()->layers.empty()) {
      status = worse(status, writeImported(report, baked, place, session.host().linearUnits()));
    } else if (imported || report.outcome == Outcome::Nothing) {
      diagnostics_.complain(path, "nothing is written: it has no camera and no null");
      status = worse(status, ExitStatus::Refused);
    }
    status = worse(status, session.finish());
    if (baked != nullptr) return status;
    // Something that did not come over counts as a warning.
    const bool whole =
        closeWithLoss(report, arguments_.quiet && !arguments_.strict, bakingCommand(place), diagnostics_);
    return arguments_.strict && !whole ? worse(status, ExitStatus::Refused) : status;
  }

  const std::vector<BakedScene>& bakes() const { return bakes_; }

 private:
  BakingCommand bakingCommand(const std::string& place) const {
    const std::string output = place == kStandardOutput ? place : shellWord(place);
    return {"mayascene export --bake" + arguments_.words, " -o " + output};
  }

  ExitStatus writeImported(const SceneReport& report, const BakedScene* baked, const std::string& place,
                           std::int32_t linearUnits) {
    const refhost::Folder& folder = *report.result.folder;
    const auto numbers =
        baked == nullptr ? numbersOf(report.path, *folder.compositions.front()) : numbersOf(*baked);
    if (!numbers) {
      diagnostics_.complain(report.path, "the file can no longer be read");
      return ExitStatus::Unreadable;
    }
    diag::Collector collector("");
    const auto composition = describe(folder, *numbers, linearUnits,
                                      {.frames = arguments_.frames,
                                       .scale = arguments_.scale,
                                       .axes = arguments_.axes.value_or(interchange::Axes::Scene),
                                       .keys = arguments_.keys},
                                      &collector);
    ExportFiles files(place, &taken_);
    const bool written = composition && write(*composition, &files, &collector);
    show(report.path, collector, diagnostics_);
    if (!files.failure().empty()) {
      diagnostics_.complain("", files.failure());
      return ExitStatus::CannotWrite;
    }
    if (!written) return ExitStatus::Refused;
    for (const std::string& file : files.written()) {
      diagnostics_.remark(report.path, "written to " + (file == kStandardOutput ? "standard output" : file));
    }
    const bool warned = arguments_.strict && collector.CountOf(diag::Severity::Warning) != 0;
    return warned ? ExitStatus::Refused : ExitStatus::Done;
  }

  bool write(const interchange::Composition& composition, ExportFiles* files, diag::Collector* collector) {
    return interchange::Write(format_, composition, {.keys = arguments_.keys}, *files, collector) &&
           files->commit();
  }

  const ExportArguments& arguments_;
  const interchange::Format& format_;
  Diagnostics& diagnostics_;
  TakenFiles taken_;
  std::vector<BakedScene> bakes_;
};

}  // namespace

ExitStatus runExport(const ExportArguments& arguments, Diagnostics& diagnostics) {
  const interchange::Format& format =
      arguments.format != nullptr ? *arguments.format : *interchange::FormatOfPath(arguments.output);
  const std::string reportPlace = arguments.bake ? arguments.bake->report : "";
  std::string failure;
  std::vector<std::string> places;
  const ExitStatus placed = placeOutputs(arguments.scenes, arguments.output, std::string(format.suffix),
                                         reportPlace, &places, &failure);
  if (placed != ExitStatus::Done) {
    diagnostics.complain("", failure);
    return placed;
  }
  std::unique_ptr<OutputFile> report;
  if (!reportPlace.empty()) {
    report = OutputFile::open(reportPlace, &failure);
    if (report == nullptr) {
      diagnostics.complain("", failure);
      return ExitStatus::CannotWrite;
    }
  }
  ExportRun run(arguments, format, diagnostics);
  run.take(places);
  ExitStatus status = ExitStatus::Done;
  for (std::size_t i = 0; i < places.size(); ++i) {
    const ExitStatus one = run.exportScene(arguments.scenes[i], places[i]);
    status = worse(status, one);
    if (one == ExitStatus::NoModule) return status;
  }
  return report ? worse(status, commitBakeReport(report.get(), run.bakes(), diagnostics)) : status;
}

}  // namespace mayascene
