// Places, turns and pictures as the tests compute them, without the code that they judge.
#pragma once

#include <array>
#include <cstddef>
#include <optional>
#include <vector>

#include "export/Composition.h"

namespace exporttest {

using Point = std::array<double, 3>;
using Rows = std::array<std::array<double, 3>, 3>;  // columns are where the axes go

// A layer in the space of its parent, or in the world.
struct Seat {
  Rows axes = {{{1, 0, 0}, {0, 1, 0}, {0, 0, 1}}};
  Point place = {0, 0, 0};
};

Rows Product(const Rows& a, const Rows& b);
Point Applied(const Rows& rows, const Point& point);
Point Applied(const Seat& seat, const Point& point);
Seat Below(const Seat& parent, const Seat& child);

// Degrees; about x first, then y, then z.
Rows TurnedXyz(const Point& degrees);
// x, y, z and the real part; of any length but 0.
Rows TurnedBy(const std::array<double, 4>& quaternion);
Rows Scaled(const Rows& rows, const Point& scale);

// Where the layer stands in the world, by the description's own words.
Seat WorldSeat(const interchange::Composition& composition, std::size_t layer, std::size_t frame);

// From the middle of the picture to the right and up, in pixels; none where the point is not in front of the
// camera. The camera looks along -z of its axes. Its scale counts.
std::optional<std::array<double, 2>> PixelOf(const Seat& camera, double zoom, const Point& point);

double Distance(const Point& a, const Point& b);
double LargestPart(const Point& a);

}  // namespace exporttest
