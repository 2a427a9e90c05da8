// From the scene's units to the host's.
#pragma once

#include "hostapi/HostTypes.h"
#include "tests/secondreader/Records.h"

namespace secondreader {

class Conversions {
 public:
  // The scene outlives the conversions.
  Conversions(const Scene& scene, bool linearUnits) : scene_(scene), linearUnits_(linearUnits) {}

  double distance(double value) const;
  double angle(double value) const;

  // The time of a key. The first key of a node can move the offset that all times are measured from.
  T_Time time(double value, bool first);
  T_Time longestAnimation() const;
  HostRatio frameRate() const;
  HostRatio pixelAspect() const;

  double filmSize(const Camera& camera) const;
  double zoom(const Camera& camera, double focalLength) const;

 private:
  const Scene& scene_;
  bool linearUnits_;
  double offset_ = 0.0;
};

}  // namespace secondreader
