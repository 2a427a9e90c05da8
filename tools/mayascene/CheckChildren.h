// Checks of scenes, each in a process of its own: imports must not overlap in one process, and a scene that
// ends its process does not end the others.
#pragma once

#include <functional>
#include <string>
#include <vector>

#include "tools/mayascene/Arguments.h"
#include "tools/mayascene/CheckResult.h"
#include "tools/mayascene/Diagnostics.h"

namespace mayascene {

// What a child does: checks the one scene, and hands the result over on standard output.
ExitStatus runCheckChild(const CheckArguments& arguments, Diagnostics& diagnostics);

// The command line of such a child, from the arguments of the whole run.
std::vector<std::string> childWords(const CheckArguments& arguments, const std::string& scene);

// The limits of the children.
PoolLimits childLimits(const CheckArguments& arguments);

// Gets the results in the order of the scenes, with the text of the child's standard error.
using ShowResult =
    std::function<void(const std::string& scene, const std::string& complaints, const CheckResult& result)>;

// Checks all scenes. NoModule when a child could not load the import module: no scene can be checked then,
// and the call returns at once.
ExitStatus checkInChildren(const CheckArguments& arguments, const std::vector<std::string>& scenes,
                           const ShowResult& show, const ProcessPool::Watch& watch);

}  // namespace mayascene
