// The units of the numbers in a scene.
#pragma once

#include <cstdint>
#include <string_view>

#include "scene/Scene.h"

namespace motion {

// The units that a scene is written in. A word that is missing or not known leaves the default.
struct Measures {
  double framesPerSecond = 24.0;
  double centimetres = 1.0;               // in one unit of length
  double radians = 0.017453292519943295;  // in one unit of angle
};

Measures MeasuresOf(const scene::Scene& scene);

// Whether the word is a unit of time that does not count frames: seconds, minutes …
bool IsClockUnit(std::string_view word);

// One frame in the scene's unit of time. Where the unit does not count frames, there are 24 frames a second.
double UnitsPerFrame(const scene::Scene& scene);

// What a plug's number measures.
enum class Kind : std::uint8_t { kPlain, kLength, kAngle, kTime };

Kind KindOf(const scene::Scene& scene, const scene::Plug& plug);

// Internal units (centimetres, radians, ticks) in one unit of the scene. Connections pass on internal units.
double InternalUnits(const Measures& measures, Kind kind);

}  // namespace motion
