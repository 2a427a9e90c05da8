// Shifts an angle by whole turns, so that it lies next to the one before.
#pragma once

#include <cmath>

namespace mayaimport {

inline constexpr double kHalfTurn = 3.141592653589793;

// As UnwrapAngle, for angles that lie half a turn apart or more.
double UnwrapTurns(double angle, double previous);

// The angle shifted by whole turns until it lies less than half a turn from the previous one (both in
// radians; a difference of exactly half a turn is shifted too). The time is bounded for any number of turns.
// An angle that is not finite, or so large that a turn no longer changes it, stays as it is.
inline double UnwrapAngle(double angle, double previous) {
  // So for nearly every key.
  return std::fabs(angle - previous) < kHalfTurn ? angle : UnwrapTurns(angle, previous);
}

}  // namespace mayaimport
