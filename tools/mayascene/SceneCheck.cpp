#include "tools/mayascene/SceneCheck.h"

#include "tools/mayascene/ImportedLayers.h"
#include "tools/mayascene/SceneFile.h"
#include "tools/mayascene/SceneText.h"

namespace mayascene {
namespace {

bool leftSomething(const refhost::CallbackResult& result, const std::string& path, Diagnostics& diagnostics) {
  for (const refhost::Leftover& leftover : result.leftovers) {
    if (!leftover.keptByDesign) diagnostics.complain(path, "left behind: " + leftover.description);
  }
  return !result.ledgerClean();
}

}  // namespace

CheckedScene checkScene(const std::string& path, const check::Options& options, HostSession& session,
                        Diagnostics& diagnostics) {
  CheckedScene checked;
  checked.path = path;
  // The process is the scene's own.
  const auto text = SceneText::map(path, &checked.failure);
  if (text == nullptr) {
    diagnostics.complain(path, checked.failure);
    return checked;
  }
  const refhost::CallbackResult result = session.host().importScene(path);
  const check::CameOver cameOver = whatCameOver(lookAtScene(path), result, session.host().linearUnits() != 0);
  checked.report = check::Check(text->text(), cameOver, options);
  const bool failed = leftSomething(result, path, diagnostics) || checked.report.errors != 0;
  checked.status = failed ? ExitStatus::Refused : ExitStatus::Done;
  return checked;
}

}  // namespace mayascene
