// The first lines of a report: what holds for the scene as a whole, and its cameras.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "check/CameOver.h"
#include "diag/Diagnostic.h"
#include "scene/Settings.h"

namespace check {

// Where the file says something. None: it does not, and the value is the default.
struct Where {
  diag::Range range;
  diag::LineAndColumn place;
};

template <typename T>
struct Given {
  T value{};
  std::optional<Where> where = {};
};

// What drives a channel.
struct Drive {
  std::string channel;              // "translateX"
  std::string node;                 // its driver
  std::string type;                 // of the driver
  std::optional<std::size_t> keys;  // of a curve
  Where where;                      // the connection
};

// A transform above a camera, or the camera's own.
struct ChainLink {
  std::string name;
  std::vector<Drive> drives;
};

struct CameraHead {
  std::string path;
  Where where;
  Given<double> focalLength;         // millimetres, where nothing drives it
  Given<double> horizontalAperture;  // inches
  Given<double> verticalAperture;
  Given<std::string> fit;        // "fill", "horizontal", "vertical", "overscan"
  double angleOfView = 0.0;      // degrees, across the picture
  std::vector<Drive> drives;     // of the lens
  std::vector<ChainLink> chain;  // from the camera's own transform upwards
  bool chainGoesOn = false;      // it has more than kMostLinks
  bool cameOver = false;         // the import made a layer of it
  std::size_t keys = 0;          // that the layer has on its place
  std::size_t zoomKeys = 0;
  std::size_t parents = 0;  // null layers above it, at most kMostLinks
};

struct Range {
  std::string what;  // "playback", "animation" or "render"
  double first = 0.0;
  double last = 0.0;
  Where where;
};

struct Head {
  bool isScene = false;  // else nothing of what follows holds
  std::string product;   // "Maya 2018"; may be empty
  Given<std::string> linearUnit{"centimeter"};
  Given<std::string> angularUnit{"degree"};
  Given<std::string> timeUnit{"film"};
  double framesPerSecond = 24.0;
  std::vector<Range> ranges;  // those that the file says
  Given<double> width;        // pixels
  Given<double> height;
  Given<double> pixelAspect;
  std::vector<CameraHead> cameras;  // those that the file creates, in its order
  std::size_t camerasNotShown = 0;  // beyond the first kMostCameras
  std::size_t nullsThatCame = 0;
  std::size_t camerasThatCame = 0;

  static constexpr std::size_t kMostCameras = 100;
  static constexpr std::size_t kMostLinks = 32;
};

}  // namespace check
