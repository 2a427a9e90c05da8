// Where the outputs of a run go, one for each scene.
#pragma once

#include <string>
#include <vector>

#include "tools/mayascene/ExitStatus.h"

namespace mayascene {

// Gives a file for each scene, and Done. `suffix` is ".ma" for bakes. The output of a single scene is
// `output`, unless that is a folder, or ends with a "/". Those of several scenes lie in the folder `output`,
// under the scenes' own names, with _2, _3 … where two are the same without regard to case. The folder is
// made where it is missing.
//
// WrongUsage, with a sentence in *failure, where an output would be written over one of the scenes or over
// `report`, and where several have no folder to go to. CannotWrite where the folder cannot be made.
ExitStatus placeOutputs(const std::vector<std::string>& scenes, const std::string& output,
                        const std::string& suffix, const std::string& report,
                        std::vector<std::string>* places, std::string* failure);

}  // namespace mayascene
