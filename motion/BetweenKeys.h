// What a curve does from key to key, where a reader of the keys alone goes straight.
#pragma once

#include "motion/Curve.h"

namespace motion {

// Whether the straight way from one key to the next leaves the curve at some whole frame.
bool IsCurvedAtFrames(const Curve& curve, double framesPerSecond);

// Whether the curve turns by half a turn or more from one key to the next, with a whole frame between them: a
// reader that takes the shorter way turns otherwise. `halfTurn` is in the unit of the curve's values.
bool TurnsFarBetweenFrames(const CurveData& curve, double halfTurn, double framesPerSecond);

}  // namespace motion
