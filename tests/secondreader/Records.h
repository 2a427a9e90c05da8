// What is kept of a scene.
#pragma once

#include <array>
#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "tests/secondreader/Words.h"

namespace secondreader {

using Triple = std::array<double, 3>;

// The places in Transform::curve.
inline constexpr std::size_t kChannels = 9;
inline constexpr std::size_t kFollowed = 9;
inline constexpr std::size_t kTarget = 10;
inline constexpr std::size_t kConstrained = 11;

struct Transform {
  std::string name;
  std::string parent;
  Triple translate{};
  Triple rotate{};
  Triple scale{1.0, 1.0, 1.0};
  Triple rotatePivot{};
  Triple scalePivot{};
  std::array<int, 12> curve{-1, -1, -1, -1, -1, -1, -1, -1, -1, -1, -1, -1};
};

struct Camera {
  std::string name;
  std::string parent;
  double horizontalAperture = 1.4173;
  double verticalAperture = 0.9449;
  double focalLength = 35.0;
  bool verticalFit = false;
  bool orthographic = false;
  int focalLengthCurve = -1;
};

struct Locator {
  std::string name;
  std::string parent;
};

struct Key {
  double time = 0.0;
  double value = 0.0;
};

struct Curve {
  std::string name;
  std::string parent;
  std::shared_ptr<std::vector<Key>> keys;  // one list for all copies of the record
};

// An empty vector is a list that was never made.
struct Scene {
  std::vector<Transform> transforms;
  std::vector<Camera> cameras;
  std::vector<Curve> curves;
  std::vector<Locator> locators;

  int timeUnit = 3;
  double frameRate = 29.97;
  int angleUnit = 1;
  int linearUnit = 2;
  std::int32_t width = 720;
  std::int32_t height = 486;
  double deviceAspectRatio = 1.3333333333333333;
  double pixelAspect = 0.9091;
};

// The index of the first record of that name; -1 when there is none.
template <typename Record>
int findNamed(const std::vector<Record>& records, const std::string& name) {
  for (std::size_t i = 0; i < records.size(); ++i) {
    if (same(records[i].name, name)) return static_cast<int>(i);
  }
  return -1;
}

}  // namespace secondreader
