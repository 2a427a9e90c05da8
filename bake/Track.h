// The channels of one written node over all frames.
#pragma once

#include <array>
#include <cstddef>
#include <vector>

namespace bake {

// One number a frame; a single one where it does not move.
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
  double skew = 0.0;        // the largest of any frame: what the channels cannot say
  double unevenness = 1.0;  // of a camera in the world: how much more one axis is scaled than another
  bool mirrors = false;     // at some frame
  bool finite = true;       // at all frames

  bool moves() const;

  // Whether two axes of any frame are not square to each other.
  bool IsSheared() const;

  // Whether one axis is scaled more than another.
  bool IsUneven() const;

  // Whether any frame has another scale than 1.
  bool IsScaled() const;
};

// The lens of a camera: what the importer takes of it.
struct LensTrack {
  Channel focalLength;              // millimetres
  double horizontalAperture = 0.0;  // inches
  double verticalAperture = 0.0;
  bool vertical = false;  // which side of the film fills the picture
  bool usable = true;     // at all frames: finite, and not 0

  // What is not said, or said in another way, at any frame.
  bool offset = false;        // the film offset
  bool squeezed = false;      // the lens squeeze is in the aperture
  bool otherEffects = false;  // changes of the picture after the projection
};

// The channel as it is written: with one value where all are the same, or nearer to each other than
// `tolerance`.
void Settle(Channel* channel, double tolerance = 0.0);

}  // namespace bake
