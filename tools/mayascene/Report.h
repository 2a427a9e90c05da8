// The results of a run, as the outline and the JSON show them.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "refhost/Host.h"
#include "tools/mayascene/ExitStatus.h"
#include "tools/mayascene/SceneBake.h"
#include "tools/mayascene/SceneNumbers.h"

namespace mayascene {

enum class Outcome {
  Imported,    // a composition was made
  Nothing,     // a Maya ASCII scene without a camera: nothing was made, and nothing is wrong
  Refused,     // not a Maya ASCII scene: the importer made nothing and returned no code
  Failed,      // the importer returned a code; what was made before stays
  Unreadable,  // the file cannot be opened, or is not a regular file; the importer was not called
};

struct SceneReport {
  std::string path;  // as the user named it; bytes
  Outcome outcome = Outcome::Unreadable;
  ExitStatus status = ExitStatus::Unreadable;
  bool explained = false;               // the reason why nothing was imported is already shown
  refhost::CallbackResult result;       // its folder lives as long as the host
  std::optional<SceneNumbers> numbers;  // where JSON was asked for and the scene could be read
};

struct RunReport {
  std::int32_t linearUnits = 0;  // the preference that the scenes were imported with
  refhost::CallbackResult entry;
  std::vector<SceneReport> scenes;
  std::vector<BakedScene> bakes;  // of each scene, where they were asked for
  refhost::CallbackResult deathHook;
};

}  // namespace mayascene
