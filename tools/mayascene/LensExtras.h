// What a scene says about its lenses beyond what a composition shows.
#pragma once

#include <cstddef>
#include <map>
#include <optional>
#include <string>

#include "scene/Scene.h"

namespace mayascene {

// Only what stays at all times, and what is other than usual: no offset, a squeeze of 1.
struct LensExtras {
  std::optional<double> filmOffsetX;  // inches, to the right; both are there or none
  std::optional<double> filmOffsetY;  // inches, upwards
  std::optional<double> squeeze;
};

// By names of cameras, or by their paths.
using LensExtrasByCamera = std::map<std::string, LensExtras>;

// Where two cameras have one name, nothing is known of either.
void addLens(const std::string& camera, const LensExtras& extras, LensExtrasByCamera* all);

// Of the cameras that an import or a bake may take.
LensExtrasByCamera lensExtrasByName(const scene::Scene& scene);
LensExtrasByCamera lensExtrasByPath(const scene::Scene& scene);

}  // namespace mayascene
