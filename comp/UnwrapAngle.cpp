#include "comp/UnwrapAngle.h"

#include <cmath>

namespace {

constexpr double kHalfTurn = 3.141592653589793;
constexpr double kTurn = 6.283185307179586;
constexpr double kManyTurns = 4.0;

bool TurnChanges(double angle) {
  return std::isfinite(angle) && angle - kTurn != angle && angle + kTurn != angle;
}

}  // namespace

double UnwrapAngle(double angle, double previous) {
  if (!TurnChanges(angle) || !TurnChanges(previous)) return angle;
  const double turns = std::trunc((angle - previous) / kTurn);
  if (std::fabs(turns) > kManyTurns) angle -= turns * kTurn;
  while (angle - previous >= kHalfTurn) angle += -kTurn;
  while (angle - previous <= -kHalfTurn) angle += kTurn;
  return angle;
}
