#include "tools/mayascene/BakeCommand.h"

#include <memory>
#include <utility>

#include "tools/mayascene/BakeOutputs.h"
#include "tools/mayascene/BakeReportJson.h"
#include "tools/mayascene/OutputFile.h"
#include "tools/mayascene/SceneBake.h"

namespace mayascene {
namespace {

BakedScene bakeTo(const std::string& path, const std::string& place, const BakeArguments& arguments,
                  Diagnostics& diagnostics) {
  std::string failure;
  const auto output = OutputFile::open(place, &failure);
  if (output == nullptr) {
    diagnostics.complain("", failure);
    BakedScene unwritten;
    unwritten.path = path;
    unwritten.status = ExitStatus::CannotWrite;
    return unwritten;
  }
  BakedScene baked = bakeScene(path, arguments, diagnostics, output->stream());
  if (!isWorthKeeping(baked, arguments.options)) return baked;
  if (output->commit(&failure)) {
    baked.output = place;
  } else {
    diagnostics.complain("", failure);
    baked.status = ExitStatus::CannotWrite;
  }
  return baked;
}

}  // namespace

ExitStatus runBake(const BakeArguments& arguments, Diagnostics& diagnostics) {
  std::string failure;
  std::vector<std::string> places;
  const ExitStatus placed =
      placeOutputs(arguments.scenes, arguments.output, ".ma", arguments.report, &places, &failure);
  if (placed != ExitStatus::Done) {
    diagnostics.complain("", failure);
    return placed;
  }
  std::unique_ptr<OutputFile> report;
  if (!arguments.report.empty()) {
    report = OutputFile::open(arguments.report, &failure);
    if (report == nullptr) {
      diagnostics.complain("", failure);
      return ExitStatus::CannotWrite;
    }
  }
  ExitStatus status = ExitStatus::Done;
  std::vector<BakedScene> scenes;
  for (std::size_t i = 0; i < places.size(); ++i) {
    BakedScene scene = bakeTo(arguments.scenes[i], places[i], arguments, diagnostics);
    showBake(scene, arguments.report, diagnostics);
    status = worse(status, scene.status);
    scenes.push_back(std::move(scene));
  }
  return report ? worse(status, commitBakeReport(report.get(), scenes, diagnostics)) : status;
}

}  // namespace mayascene
