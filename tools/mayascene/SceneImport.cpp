#include "tools/mayascene/SceneImport.h"

#include <filesystem>

#include "tools/mayascene/SceneFile.h"
#include "tools/mayascene/TemporaryBake.h"

namespace mayascene {
namespace {

// For a file that is not a Maya ASCII scene the importer shows a message, makes nothing and returns 0. It
// makes nothing of a scene without cameras either. Two signs distinguish them: the file does not begin as a
// scene, or the host showed a message (the file changed, or could not be read, after the look).
Outcome outcomeOf(const SceneLook& look, const refhost::CallbackResult& result) {
  if (result.code != 0) return Outcome::Failed;
  if (result.folder != nullptr && !result.folder->compositions.empty()) return Outcome::Imported;
  return look.mayaHeader && result.messages.empty() ? Outcome::Nothing : Outcome::Refused;
}

// Replaces the bake's path by the scene's in texts of the host, which knows only the bake. Both have the same
// file name.
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
  // Comes first: a path that leads to no file may have no name that a bake could take.
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
  diagnostics.complain(report.path, "refused: it is not a Maya ASCII scene");
  return ExitStatus::Refused;
}

}  // namespace mayascene
