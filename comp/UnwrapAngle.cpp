#include "comp/UnwrapAngle.h"

#include <algorithm>
#include <cmath>

namespace mayaimport {

namespace {

constexpr double kTurn = 6.283185307179586;
constexpr double kFewTurns = 4.0;

bool TurnChanges(double angle) {
  return std::isfinite(angle) && angle - kTurn != angle && angle + kTurn != angle;
}

// Moves the angle by turns (of either sign) until only a few are left to the previous one. Between two powers
// of two every turn changes a double by the same amount, so all turns that fit there are taken at once. The
// result is the same, to the last bit, as that of one turn at a time.
[[gnu::noinline]] double TakeManyTurns(double angle, double previous, double turn) {
  while ((previous - angle) / turn > kFewTurns) {
    const double first = angle + turn;
    const double second = first + turn;
    const double step = second - first;
    const bool sameSpacing =
        std::ilogb(angle) == std::ilogb(second) && std::signbit(angle) == std::signbit(second);
    angle = first;
    if (!sameSpacing) continue;
    angle = second;
    const double low = std::ldexp(1.0, std::ilogb(angle));
    const double room =
        std::signbit(angle) == std::signbit(turn) ? 2.0 * low - std::fabs(angle) : std::fabs(angle) - low;
    const double turns =
        std::floor(std::min(room / std::fabs(step), (previous - angle) / step - kFewTurns)) - 1.0;
    if (turns > 0.0) angle += turns * step;
  }
  return angle;
}

}  // namespace

double UnwrapTurns(double angle, double previous) {
  if (!TurnChanges(angle) || !TurnChanges(previous)) return angle;
  angle = TakeManyTurns(angle, previous, angle > previous ? -kTurn : kTurn);
  while (angle - previous >= kHalfTurn) angle += -kTurn;
  while (angle - previous <= -kHalfTurn) angle += kTurn;
  return angle;
}

}  // namespace mayaimport
