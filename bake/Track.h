// The values of one written node over all frames.
#pragma once

#include <array>
#include <cstddef>
#include <vector>

namespace bake {

// One number per frame; a single one where it does not move.
struct Channel {
  std::vector<double> values;

  bool moves() const { return values.size() > 1; }
  double At(std::size_t frame) const { return values[moves() ? frame : 0]; }
};

enum ChannelSlot : std::size_t {
  kTranslateX,
  kTranslateY,
  kTranslateZ,
  kRotateX,
  kRotateY,
  kRotateZ,
  kScaleX,
  kScaleY,
  kScaleZ,
  kSlotCount,
};

// Translation in the scene's unit, rotation in degrees, XYZ, and scale.
struct Track {
  std::array<Channel, kSlotCount> channels;
  double skew = 0.0;  // the largest of any frame, as motion::Skew has it
  double unevenness =
      1.0;               // of a camera in world space: the largest of any frame, as motion::Unevenness has it
  bool mirrors = false;  // at some frame
  bool finite = true;    // at all frames

  bool moves() const;

  // Whether two axes of any frame are not square to each other.
  bool IsSheared() const;

  // Whether one axis is scaled more than another.
  bool IsUneven() const;

  // Whether any frame has another scale than 1.
  bool IsScaled() const;
};

// The lens of a camera, in the values that the importer takes.
struct LensTrack {
  Channel focalLength;              // millimetres
  double horizontalAperture = 0.0;  // inches
  double verticalAperture = 0.0;
  bool vertical = false;  // whether the vertical side of the film fills the picture
  bool usable = true;     // at all frames: finite and above 0

  // What is lost, or written in another way, at any frame.
  bool offset = false;        // the film offset
  bool squeezed = false;      // the lens squeeze is in the aperture
  bool otherEffects = false;  // changes of the picture after the projection
};

// Reduces the channel to one value where no value differs from the first by more than `tolerance`. The
// channel has at least one value.
void Settle(Channel* channel, double tolerance = 0.0);

}  // namespace bake
