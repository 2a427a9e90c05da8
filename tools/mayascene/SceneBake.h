// The bake of one scene: reads, evaluates, writes, and shows the result.
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

// The result of one scene, for the report.
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

// Reads the scene and writes its bake. A file that cannot be read (Unreadable), or that is not a Maya ASCII
// scene (Refused), is reported at once, and nothing is written. Else Done, or Refused where something that
// was asked for could not be written, and where there are warnings and --strict counts them.
BakedScene bakeScene(const std::string& path, const BakeArguments& arguments, Diagnostics& diagnostics,
                     std::ostream& out);

// Whether the bake has frames and, where cameras are named, one of them.
bool isWorthKeeping(const BakedScene& scene, const bake::Options& options);

// Writes to standard error: a line for each camera, errors and warnings, and the number of notes. `report` is
// the file that holds them all, empty where there is none.
void showBake(const BakedScene& scene, const std::string& report, Diagnostics& diagnostics);

}  // namespace mayascene
