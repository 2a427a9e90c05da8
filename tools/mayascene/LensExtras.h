// Values of a scene's lenses that a composition cannot hold.
#pragma once

#include <cstddef>
#include <map>
#include <optional>
#include <string>

#include "scene/Scene.h"

namespace mayascene {

// Only values that stay at all times and differ from the defaults: no offset, a squeeze of 1.
struct LensExtras {
  std::optional<double> filmOffsetX;  // inches, to the right; both offsets are set, or none
  std::optional<double> filmOffsetY;  // inches, upwards
  std::optional<double> squeeze;
};

// By names of cameras, or by their paths.
using LensExtrasByCamera = std::map<std::string, LensExtras>;

// Adds a camera's extras. Where two cameras have the same name, both have none.
void addLens(const std::string& camera, const LensExtras& extras, LensExtrasByCamera* all);

// Of the cameras that an import or a bake may take.
LensExtrasByCamera lensExtrasByName(const scene::Scene& scene);
LensExtrasByCamera lensExtrasByPath(const scene::Scene& scene);

}  // namespace mayascene
