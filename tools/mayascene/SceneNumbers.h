// A composition's times, lengths and lenses in the scene's own numbers.
#pragma once

#include <optional>
#include <string>

#include "refhost/Project.h"
#include "scene/Scene.h"
#include "tools/mayascene/LensExtras.h"
#include "tools/mayascene/SceneBake.h"

namespace mayascene {

struct SceneNumbers {
  // The frame at time 0 of the composition, and that of its last key. None where nothing is keyed.
  std::optional<double> firstFrame;
  std::optional<double> lastFrame;
  LensExtrasByCamera lenses{};  // by the names of the layers
  std::string linearUnit;       // "cm", "meter", …: as linearUnitOf
};

// The scene's word for its unit of length; "cm" where it sets none, or one that is not known.
std::string linearUnitOf(const scene::Scene& scene);

// The smallest first key among what an import takes of the scene: its cameras, its marked locators, and the
// transforms above them. None where none of them has keys; 0 where the scene's time counts no frames.
std::optional<double> firstKeyOf(const scene::Scene& scene);

// Of a plain import. None where the file can no longer be read, or where the memory is too small for the
// scene and the project.
std::optional<SceneNumbers> numbersOf(const std::string& path, const refhost::Composition& composition);

// Of an import of the bake.
SceneNumbers numbersOf(const BakedScene& baked);

// The last key of all layers, in frames of the composition from its time 0. None where there is no key, or no
// rate.
std::optional<double> lastKeyOf(const refhost::Composition& composition);

// A time of the composition in its frames. Not for a scale or a denominator of 0.
inline double framesAt(const T_Time& time, const HostRatio& rate) {
  // Whole frames of whole rates come out whole: both products are exact.
  return static_cast<double>(time.value) * static_cast<double>(rate.numerator) /
         (static_cast<double>(time.scale) * static_cast<double>(rate.denominator));
}

}  // namespace mayascene
