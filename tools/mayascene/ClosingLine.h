// What an import says last about a scene: what did not come over, and the command to run.
#pragma once

#include <string>
#include <string_view>

#include "tools/mayascene/Diagnostics.h"
#include "tools/mayascene/Report.h"

namespace mayascene {

// Reads the scene again and says the first thing of it that the import did not bring, in one line. Says
// nothing where all came over, where the scene is none, and where its file can no longer be read. `quiet`:
// only after an import that stopped.
void closeWithLoss(const SceneReport& report, bool quiet, Diagnostics& diagnostics);

// A word of a command, as a shell takes it: what a terminal would act on, and bytes that are no text, are
// escaped.
std::string shellWord(std::string_view bytes);

}  // namespace mayascene
