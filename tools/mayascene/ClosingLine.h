// What an import or export says last about a scene: what did not come over, and the command to run.
#pragma once

#include <string>
#include <string_view>

#include "tools/mayascene/Diagnostics.h"
#include "tools/mayascene/Report.h"

namespace mayascene {

// The same run with a bake, as the user types it: what stands before the scene, and after it.
struct BakingCommand {
  std::string before = "mayascene import --bake";
  std::string after;
};

// Reads the scene again and says the first thing of it that the import did not bring, in one line, with the
// command that brings it. Says nothing where all came over, where the scene is none, and where its file can
// no longer be read. `quiet`: only after an import that stopped.
//
// False where something did not come over, and where the memory is too small to know.
bool closeWithLoss(const SceneReport& report, bool quiet, const BakingCommand& command,
                   Diagnostics& diagnostics);

// A word of a command, as a shell takes it: what a terminal would act on, and bytes that are no text, are
// escaped.
std::string shellWord(std::string_view bytes);

}  // namespace mayascene
