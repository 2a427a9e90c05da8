#include "motion/BetweenKeys.h"

#include <algorithm>
#include <cmath>
#include <vector>

#include "motion/FrameEnds.h"

namespace motion {
namespace {

// Between two keys a curve is a cubic: if it meets the straight line at so many frames, it is the line.
constexpr double kFramesOfSpan = 8.0;

// Relative: scenes write values with limited digits.
constexpr double kTolerance = 1e-6;

// The first whole frame after the time.
double FrameAfter(double time, double framesPerSecond) {
  return std::floor(time * framesPerSecond + kFrameTolerance) + 1.0;
}

}  // namespace

bool IsCurvedAtFrames(const Curve& curve, double framesPerSecond) {
  const std::vector<CurveKey>& keys = curve.Data().keys;
  CurveCursor cursor;
  for (std::size_t i = 0; i + 1 < keys.size(); ++i) {
    const CurveKey& from = keys[i];
    const CurveKey& to = keys[i + 1];
    const double tolerance = kTolerance * (1.0 + std::fabs(from.value) + std::fabs(to.value));
    const double end = to.time * framesPerSecond - kFrameTolerance;
    double frame = FrameAfter(from.time, framesPerSecond);
    const double step = std::max(1.0, std::floor((end - frame) / kFramesOfSpan));
    for (; frame < end; frame += step) {
      const double time = frame / framesPerSecond;
      const double part = (time - from.time) / (to.time - from.time);
      const double straight = from.value + part * (to.value - from.value);
      if (std::fabs(curve.At(time, &cursor) - straight) > tolerance) return true;
    }
  }
  return false;
}

bool TurnsFarBetweenFrames(const CurveData& curve, double halfTurn, double framesPerSecond) {
  for (std::size_t i = 1; i < curve.keys.size(); ++i) {
    const CurveKey& from = curve.keys[i - 1];
    const CurveKey& to = curve.keys[i];
    if (std::fabs(to.value - from.value) < halfTurn) continue;
    if (FrameAfter(from.time, framesPerSecond) < to.time * framesPerSecond - kFrameTolerance) return true;
  }
  return false;
}

}  // namespace motion
