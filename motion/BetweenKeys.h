// Compares a curve with straight lines between its keys, as a reader that takes only the keys has them.
#pragma once

#include "motion/Curve.h"

namespace motion {

// Whether the straight way from one key to the next leaves the curve at some whole frame.
bool IsCurvedAtFrames(const Curve& curve, double framesPerSecond);

// Whether the curve turns by half a turn or more from one key to the next, with a whole frame between them. A
// reader that takes the shorter way then turns in the other direction. `halfTurn` is in the unit of the
// curve's values.
bool TurnsFarBetweenFrames(const CurveData& curve, double halfTurn, double framesPerSecond);

}  // namespace motion
