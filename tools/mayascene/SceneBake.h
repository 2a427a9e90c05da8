// One scene's bake: read, evaluated, written, and what is said about it.
#pragma once

#include <cstdint>
#include <ostream>
#include <string>
#include <vector>

#include "bake/Bake.h"
#include "diag/Collector.h"
#include "tools/mayascene/BakeCommand.h"
#include "tools/mayascene/Diagnostics.h"
#include "tools/mayascene/ExitStatus.h"
#include "tools/mayascene/LensExtras.h"

namespace mayascene {

// What came of one scene, for the report.
struct BakedScene {
  std::string path;    // as the user named it; bytes
  std::string output;  // the bake's, empty where there is none
  ExitStatus status = ExitStatus::Unreadable;
  std::string linearUnit;       // of the scene's lengths, as SceneNumbers has it
  LensExtrasByCamera lenses{};  // by the paths of the scene's cameras
  bake::Report report;
  std::vector<diag::Diagnostic> diagnostics;  // with their places, the worst first
  std::uint64_t errors = 0;
  std::uint64_t warnings = 0;
  std::uint64_t notes = 0;
};

// Reads the scene and writes its bake. A file that cannot be read, or that is no Maya ASCII scene, is said at
// once, and nothing is written: Unreadable, Refused. Else Done, or Refused where something that was asked for
// could not be written, and where there are warnings and they count.
BakedScene bakeScene(const std::string& path, const BakeArguments& arguments, Diagnostics& diagnostics,
                     std::ostream& out);

// Whether the bake holds what was asked for: it has frames, and one of the cameras where some are named.
bool isWorthKeeping(const BakedScene& scene, const bake::Options& options);

// On standard error: a line a camera, errors and warnings, and how many notes there are. `report` is the file
// that holds them all, empty where there is none.
void showBake(const BakedScene& scene, const std::string& report, Diagnostics& diagnostics);

}  // namespace mayascene
