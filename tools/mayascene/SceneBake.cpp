#include "tools/mayascene/SceneBake.h"

#include <algorithm>
#include <filesystem>
#include <map>

#include "diag/Codes.h"
#include "scene/Scene.h"
#include "text/Numbers.h"
#include "tools/mayascene/Quantities.h"
#include "tools/mayascene/SceneFile.h"
#include "tools/mayascene/SceneNumbers.h"
#include "tools/mayascene/SceneText.h"
#include "tools/mayascene/Version.h"

namespace mayascene {
namespace {

constexpr int kShownPerCode = 3;

std::string framesOf(const bake::FrameRange& frames) {
  if (frames.count == 1) return "frame " + text::ShortestNumber(frames.first);
  std::string text =
      "frames " + text::ShortestNumber(frames.first) + " to " + text::ShortestNumber(frames.Last());
  if (frames.step != 1.0) text += " by " + text::ShortestNumber(frames.step);
  return text;
}

std::string describe(const bake::CameraReport& camera, const bake::FrameRange& frames) {
  std::string text = camera.path + ": ";
  if (!camera.written) return text + "not written";
  text += camera.moves || camera.lensMoves ? "baked over " + framesOf(frames) : "it does not move";
  if (camera.method == bake::Method::kWorld) text += ", in world space";
  if (camera.lensMoves) text += ", with its lens";
  return text;
}

void gather(const diag::Collector& collector, BakedScene* scene) {
  scene->diagnostics.assign(collector.kept().begin(), collector.kept().end());
  std::stable_sort(scene->diagnostics.begin(), scene->diagnostics.end(),
                   [](const diag::Diagnostic& a, const diag::Diagnostic& b) {
                     return diag::EntryOf(a.code).severity > diag::EntryOf(b.code).severity;
                   });
  scene->errors = collector.CountOf(diag::Severity::Error);
  scene->warnings = collector.CountOf(diag::Severity::Warning);
  scene->notes = collector.CountOf(diag::Severity::Note);
}

}  // namespace

BakedScene bakeScene(const std::string& path, const BakeArguments& arguments, Diagnostics& diagnostics,
                     std::ostream& out) {
  BakedScene baked;
  baked.path = path;
  std::string failure;
  const auto text = SceneText::open(path, &failure);
  if (text == nullptr) {
    diagnostics.complain(path, failure);
    return baked;
  }
  if (!beginsAsScene(text->text())) {
    diagnostics.complain(path, "refused: it is not a Maya ASCII scene");
    baked.status = ExitStatus::Refused;
    return baked;
  }
  diag::Collector collector(text->text());
  const scene::Scene scene = scene::Read(text->text(), collector);
  const bake::Origin origin{std::string("mayascene ") + kVersion,
                            std::filesystem::path(path).filename().string(), arguments.words};
  baked.linearUnit = linearUnitOf(scene);
  baked.lenses = lensExtrasByPath(scene);
  baked.report = bake::Bake(scene, arguments.options, origin, &collector, out);
  gather(collector, &baked);
  const bool allWritten = std::all_of(baked.report.cameras.begin(), baked.report.cameras.end(),
                                      [](const bake::CameraReport& camera) { return camera.written; });
  const bool warned = arguments.strict && baked.warnings != 0;
  baked.status = allWritten && baked.errors == 0 && !warned ? ExitStatus::Done : ExitStatus::Refused;
  return baked;
}

bool isWorthKeeping(const BakedScene& scene, const bake::Options& options) {
  if (!scene.report.frames) return false;
  const std::vector<bake::CameraReport>& cameras = scene.report.cameras;
  return (options.cameras.empty() && cameras.empty()) ||
         std::any_of(cameras.begin(), cameras.end(),
                     [](const bake::CameraReport& camera) { return camera.written; });
}

void showBake(const BakedScene& scene, const std::string& report, Diagnostics& diagnostics) {
  std::map<diag::Code, int> shown;
  std::uint64_t left = scene.errors + scene.warnings;
  for (const diag::Diagnostic& one : scene.diagnostics) {
    const bool isNote = diag::EntryOf(one.code).severity == diag::Severity::Note;
    if (isNote || ++shown[one.code] > kShownPerCode) continue;
    diagnostics.show(scene.path, one);
    --left;
  }
  const std::string where = report.empty() ? ": add --report FILE to see all" : ": all are in " + report;
  if (left != 0) diagnostics.remark(scene.path, std::to_string(left) + " more of these" + where);
  if (scene.notes != 0) diagnostics.remark(scene.path, countText(scene.notes, "note") + where);
  if (!scene.report.frames) return;
  for (const bake::CameraReport& camera : scene.report.cameras) {
    diagnostics.remark(scene.path, describe(camera, *scene.report.frames));
  }
}

}  // namespace mayascene
