// The slopes of a curve at its keys: as the file writes them, else by the rule of the tangent's type.
#pragma once

#include <cstddef>

#include "motion/CurveData.h"

namespace motion {

enum class Side { kIn, kOut };

std::uint8_t TangentType(const CurveData& curve, Side side, std::size_t key);

// The tangent of a key in the unit of the keys' values. Where it is not written, x is the length of the span
// on that side, so that a weighted handle lies at a third of it, and 1 at the ends. The keys are in ascending
// order.
Tangent TangentAt(const CurveData& curve, Side side, std::size_t key);

// y / x; 0 where x is 0.
double Slope(const Tangent& tangent);

}  // namespace motion
