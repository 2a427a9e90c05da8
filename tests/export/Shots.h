// Compositions for the tests of writers.
#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include "export/Composition.h"
#include "tests/export/Space.h"

namespace exporttest {

// The axes say where a camera looks.
interchange::Composition RigShot(
    interchange::Axes axes = interchange::Axes::Scene);  // parents, scale, many turns, zoom
interchange::Composition AimedShot(interchange::Axes axes = interchange::Axes::Scene);  // two aimed cameras
interchange::Composition StillShot(interchange::Axes axes = interchange::Axes::Scene);  // nothing moves
interchange::Composition KeyedShot(interchange::Axes axes = interchange::Axes::Scene);  // keys, not frames

struct NamedShot {
  std::string name;
  interchange::Composition composition;
};
std::vector<NamedShot> AllShots(interchange::Axes axes = interchange::Axes::Scene);

// Points before a camera at a frame, near and far, in the middle and at the rim.
std::vector<Point> PointsBefore(const interchange::Composition& composition, std::size_t camera,
                                std::size_t frame);

}  // namespace exporttest
