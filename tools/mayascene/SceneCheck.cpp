#include "tools/mayascene/SceneCheck.h"

#include <future>
#include <string_view>
#include <system_error>

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

// Not valid where no thread is available, and where the text does not begin as a scene.
std::future<check::Reading> readingOf(std::string_view text, const CheckArguments& arguments) {
  if (!arguments.twoThreads || !beginsAsScene(text)) return {};
  try {
    return std::async(std::launch::async,
                      [text, &arguments] { return check::Reading(text, arguments.options); });
  } catch (const std::system_error&) {
    return {};
  }
}

}  // namespace

CheckedScene checkScene(const std::string& path, const CheckArguments& arguments, HostSession& session,
                        Diagnostics& diagnostics) {
  CheckedScene checked;
  checked.path = path;
  // Mapped, because this process works for this file alone.
  const auto text = SceneText::map(path, &checked.failure);
  if (text == nullptr) {
    diagnostics.complain(path, checked.failure);
    return checked;
  }
  std::future<check::Reading> reading = readingOf(text->text(), arguments);
  const refhost::CallbackResult result = session.host().importScene(path);
  const check::CameOver cameOver = whatCameOver(lookAtScene(path), result, session.host().linearUnits() != 0);
  checked.report = reading.valid() ? check::Check(reading.get(), cameOver)
                                   : check::Check(text->text(), cameOver, arguments.options);
  const bool failed = leftSomething(result, path, diagnostics) || checked.report.errors != 0;
  checked.status = failed ? ExitStatus::Refused : ExitStatus::Done;
  return checked;
}

}  // namespace mayascene
