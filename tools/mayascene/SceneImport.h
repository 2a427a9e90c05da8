// One scene's import, as it is or by way of a bake.
#pragma once

#include <string>

#include "tools/mayascene/BakeCommand.h"
#include "tools/mayascene/Diagnostics.h"
#include "tools/mayascene/HostSession.h"
#include "tools/mayascene/Report.h"

namespace mayascene {

// A file that cannot be opened is said at once.
SceneReport importOne(const std::string& path, HostSession& session, Diagnostics& diagnostics);

// Bakes the scene and imports the bake; what is said names the scene.
SceneReport importBaked(const std::string& path, const BakeArguments& arguments, HostSession& session,
                        Diagnostics& diagnostics, BakedScene* baked);

// What goes to standard error about one scene, and its status.
ExitStatus judgeScene(const SceneReport& report, bool outlinePrinted, Diagnostics& diagnostics);

}  // namespace mayascene
