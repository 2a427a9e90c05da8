// What an import or export says last about a scene: what did not come over, and the command to run.
#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "bake/Loss.h"
#include "diag/Collector.h"
#include "refhost/Host.h"
#include "scene/Scene.h"
#include "tools/mayascene/Diagnostics.h"
#include "tools/mayascene/Report.h"

namespace mayascene {

// The same run with a bake, as the user types it: what stands before the scene, and after it.
struct BakingCommand {
  std::string before = "mayascene import --bake";
  std::string after;
};

// Reads the scene again and shows, in one line, the first thing that did not come over, with the command that
// brings it over. Shows nothing where all came over, where the file is not a scene, and where it can no
// longer be read. `quiet`: only after an import that stopped.
//
// False where something did not come over, and where the memory is exhausted.
bool closeWithLoss(const SceneReport& report, bool quiet, const BakingCommand& command,
                   Diagnostics& diagnostics);

// The first thing of the scene that did not come over; none where all did. The collector is that with which
// the scene was read.
std::optional<bake::Loss> lossOf(const refhost::CallbackResult& result, const scene::Scene& scene,
                                 diag::Collector* collector);

// A word of a command, as a shell takes it. Signs that a terminal would act on, and bytes that are not text,
// are escaped.
std::string shellWord(std::string_view bytes);

}  // namespace mayascene
