// How the importer converts lengths.
#pragma once

#include <string_view>

namespace check {

// Points of the layers in one unit of the scene, where distances are converted.
double PointsPerUnit(std::string_view word);

}  // namespace check
