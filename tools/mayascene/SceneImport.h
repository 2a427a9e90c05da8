// The import of one scene, as it is or through a bake.
#pragma once

#include <string>

#include "tools/mayascene/BakeCommand.h"
#include "tools/mayascene/Diagnostics.h"
#include "tools/mayascene/HostSession.h"
#include "tools/mayascene/Report.h"

namespace mayascene {

// Reports a file that cannot be opened at once.
SceneReport importOne(const std::string& path, HostSession& session, Diagnostics& diagnostics);

// Bakes the scene and imports the bake. Messages name the scene.
SceneReport importBaked(const std::string& path, const BakeArguments& arguments, HostSession& session,
                        Diagnostics& diagnostics, BakedScene* baked);

// Writes the messages about one scene to standard error, and returns its status.
ExitStatus judgeScene(const SceneReport& report, bool outlinePrinted, Diagnostics& diagnostics);

}  // namespace mayascene
