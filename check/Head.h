// The first lines of a report: what holds for the scene as a whole, its cameras, its marked
// locators and its look-ats.
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

// A camera or a marked locator: where it hangs, and the layer that the import made of it.
struct ShapeHead {
  std::string path;
  Where where;
  std::vector<ChainLink> chain;  // from the shape's own transform upwards
  bool chainGoesOn = false;      // it has more than kMostLinks
  bool cameOver = false;         // the import made a layer of it
  std::size_t keys = 0;          // that the layer has on its place
  std::size_t parents = 0;       // null layers above it, at most kMostLinks
};

// From the smallest value to the largest one.
struct Span {
  double least = 0.0;
  double largest = 0.0;
};

// The values that a driven lens takes. None: nothing drives it, or its values cannot be computed.
struct LensOverFrames {
  double first = 0.0;  // frames: what is played, and all keys of such cameras
  double last = 0.0;
  std::optional<Span> focalLength;  // units as in CameraHead
  std::optional<Span> horizontalAperture;
  std::optional<Span> verticalAperture;
  std::optional<Span> orthographicWidth;
  std::optional<Span> angleOfView;  // none where any of the lens cannot be computed
};

// How far the import's picture is from the scene's, at most.
struct LargestShift {
  double pixels = 0.0;
  double frame = 0.0;  // at which it is the largest
};

struct CameraHead : ShapeHead {
  Given<double> focalLength;         // millimetres; as it is stored, whether or not something drives it
  Given<double> horizontalAperture;  // inches, stored
  Given<double> verticalAperture;
  Given<std::string> fit;                          // "fill", "horizontal", "vertical", "overscan"
  double angleOfView = 0.0;                        // degrees, across the picture, of the stored lens
  std::optional<Given<double>> orthographicWidth;  // the scene's unit; of an orthographic camera alone
  std::vector<Drive> drives;                       // of the lens
  std::optional<LensOverFrames> overFrames;        // of a lens that is driven
  std::size_t zoomKeys = 0;                        // of the layer
  std::optional<LargestShift> shift;               // none: not measured
};

// A look-at, whatever it turns.
struct LookAtHead {
  std::string name;
  Where where;
  std::string turns;   // the node that it turns; empty: none
  std::string camera;  // the camera that the import aims by it; empty: none
  std::string target;  // the node that this camera is aimed at
};

struct NamedFrames {
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
  std::vector<NamedFrames> ranges;  // those that the file says
  Given<double> width;              // pixels
  Given<double> height;
  Given<double> pixelAspect;
  std::vector<CameraHead> cameras;  // those that the file creates, in its order
  std::size_t camerasNotShown = 0;  // beyond the first kMostOfAKind, as with the next two
  std::vector<ShapeHead> locators;  // those that are marked
  std::size_t locatorsNotShown = 0;
  std::vector<LookAtHead> lookAts;  // those that turn a camera, then the others
  std::size_t lookAtsNotShown = 0;
  std::size_t nullsThatCame = 0;
  std::size_t camerasThatCame = 0;
  std::optional<CameOverComposition> composition;  // that the import made

  static constexpr std::size_t kMostOfAKind = 100;  // where not all are asked for
  static constexpr std::size_t kMostLinks = 32;
};

}  // namespace check
