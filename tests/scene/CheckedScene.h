// What holds for every scene, whatever text it was read from.
#pragma once

#include <string>

#include "diag/Collector.h"
#include "scene/Scene.h"

namespace testsupport {

// Empty where all of it holds; else what does not.
std::string BrokenPromise(const scene::Scene& scene, const diag::Collector& diagnostics);

// All that the scene says, as text.
std::string Describe(const scene::Scene& scene);

}  // namespace testsupport
