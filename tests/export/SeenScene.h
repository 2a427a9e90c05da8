// The scene that a reader of the tests' own finds in an exported file, whatever its format.
#pragma once

#include <array>
#include <cstddef>
#include <optional>
#include <stdexcept>
#include <string>
#include <vector>

#include "tests/export/Space.h"

namespace exporttest {

// The file breaks a rule of its format.
struct Broken : std::runtime_error {
  using std::runtime_error::runtime_error;
};

// A value, or values at rising times with straight lines between them.
struct Track {
  std::vector<double> times;  // empty: one value
  std::vector<std::array<double, 4>> values;

  std::array<double, 4> At(double time, bool quaternions = false) const;
};

struct SeenLayer {
  std::string name;
  std::optional<std::size_t> parent;
  bool camera = false;
  bool quaternions = false;  // or degrees about x, y and z
  Track position{{}, {{0, 0, 0, 0}}};
  Track rotation{{}, {{0, 0, 0, 0}}};
  Track scale{{}, {{1, 1, 1, 0}}};
  Track lens{{}, {{0, 0, 0, 0}}};     // of a camera: the height of half the picture at distance 1
  double aspect = 1.0;                // of a camera: its picture's width over its height
  std::array<double, 2> offset = {};  // of a camera: the film's, as part of its width and height
};

struct SeenScene {
  std::vector<SeenLayer> layers;
  double metersPerUnit = 1.0;
  std::array<double, 2> range = {0, 0};  // of its times
  double timesPerSecond = 1.0;

  Seat WorldOf(std::size_t layer, double time) const;
  // The zoom in pixels of a picture of so many pixels of height.
  double ZoomOf(std::size_t layer, double time, double height) const;
};

}  // namespace exporttest
