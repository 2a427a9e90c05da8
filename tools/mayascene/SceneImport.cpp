#include "tools/mayascene/SceneImport.h"

#include <filesystem>

#include "tools/mayascene/SceneFile.h"
#include "tools/mayascene/TemporaryBake.h"

namespace mayascene {
namespace {

// The importer answers a file that is no Maya ASCII scene with a message and code 0, having made nothing. Two
// signs distinguish it from a scene without cameras, of which nothing is made either: the file does not begin
// as one, or the host showed a message (a file that changed, or could not be read, after the look).
Outcome outcomeOf(const SceneLook& look, const refhost::CallbackResult& result) {
  if (result.code != 0) return Outcome::Failed;
  if (result.folder != nullptr && !result.folder->compositions.empty()) return Outcome::Imported;
  return look.mayaHeader && result.messages.empty() ? Outcome::Nothing : Outcome::Refused;
}

// The host knows the bake's path alone; what it says is shown with the scene's. Both have one file name.
void nameScene(const std::filesystem::path& bake, const std::string& scene, refhost::CallbackResult* result) {
  const std::string bakeFolder = bake.parent_path().string() + '/';
  const std::string sceneFolder = scene.substr(0, scene.rfind('/') + 1);
  const auto replace = [&](std::string* text) {
    for (std::size_t at = text->find(bakeFolder); at != std::string::npos; at = text->find(bakeFolder, at)) {
      text->replace(at, bakeFolder.size(), sceneFolder);
      at += sceneFolder.size();
    }
  };
  for (refhost::Leftover& leftover : result->leftovers) replace(&leftover.description);
  for (std::string& refusal : result->refusals) replace(&refusal);
  for (std::string& message : result->messages) replace(&message);
}

}  // namespace

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

SceneReport importBaked(const std::string& path, const BakeArguments& arguments, HostSession& session,
                        Diagnostics& diagnostics, BakedScene* baked) {
  SceneReport report;
  report.path = path;
  baked->path = path;
  // A path that leads to no file need not have a name that a bake could have.
  const SceneLook look = lookAtScene(path);
  if (!look.readable) {
    diagnostics.complain(path, look.failure);
    return report;
  }
  std::string failure;
  const auto bake = TemporaryBake::make(std::filesystem::path(path).filename().string(), &failure);
  if (bake != nullptr) {
    *baked = bakeScene(path, arguments, diagnostics, bake->stream());
    showBake(*baked, arguments.report, diagnostics);
  }
  if (bake == nullptr || !bake->finish(&failure)) {
    diagnostics.complain(path, failure);
    report.status = baked->status = ExitStatus::CannotWrite;
    return report;
  }
  report.status = baked->status;
  if (!isWorthKeeping(*baked, arguments.options)) {
    report.explained = true;
    if (report.status != ExitStatus::Unreadable) report.outcome = Outcome::Refused;
    return report;
  }
  report.result = session.host().importScene(bake->path());
  nameScene(bake->path(), path, &report.result);
  report.outcome = outcomeOf(lookAtScene(bake->path()), report.result);
  return report;
}

ExitStatus judgeScene(const SceneReport& report, bool outlinePrinted, Diagnostics& diagnostics) {
  if (report.outcome == Outcome::Unreadable || report.explained) return report.status;
  if (!outlinePrinted) diagnostics.messages(report.path, report.result);
  const ExitStatus status = diagnostics.judge(report.path, report.result);
  if (report.outcome != Outcome::Refused) return status;
  diagnostics.complain(report.path, "refused: it is no Maya ASCII scene");
  return ExitStatus::Refused;
}

}  // namespace mayascene
