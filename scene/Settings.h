// The settings of a whole scene: units, frame rate, ranges, resolution, and where the file sets each.
#pragma once

#include <optional>
#include <string>

#include "diag/Collector.h"
#include "scene/Scene.h"
#include "scene/Units.h"

namespace scene {

// A value, and where the file sets it; without a place it is the default.
template <typename T>
struct Said {
  T value{};
  std::optional<diag::Range> place = {};

  bool operator==(const Said&) const = default;
};

// In frames of the scene's rate; fractions occur.
struct FrameRange {
  double first = 0.0;
  double last = 0.0;

  bool operator==(const FrameRange&) const = default;
};

struct Settings {
  Said<double> centimetersPerUnit{1.0};
  Said<AngularUnit> angularUnit{AngularUnit::Degree};
  Said<FrameRate> rate{FrameRate{24, 1}};

  // Of the playback options: the part that is played, and the whole animation.
  std::optional<Said<FrameRange>> playback = {};
  std::optional<Said<FrameRange>> animation = {};
  // Of the render settings.
  std::optional<Said<FrameRange>> render = {};
  // The frame at which the scene was saved.
  Said<double> currentFrame{1.0};

  Said<double> width{960.0};  // pixels
  Said<double> height{540.0};
  Said<double> deviceAspect{1.7777777};

  // The year of the version that wrote the scene, from `requires` or else from the file's product; 0 where
  // neither has it.
  Said<int> version{0};
  std::string product = {};  // "Maya 2018"

  // The width of a pixel by its height, which follows from the three above; within 0.01 of 1 it is 1. 1 where
  // one of the three is not positive.
  double pixelAspect() const;

  // The width of the picture by its height: that of the resolution times the pixel aspect.
  double pictureAspect() const;
};

// Reports values that cannot be read; they are then the default.
Settings ReadSettings(const Scene& scene, diag::Collector& diagnostics);

}  // namespace scene
