// Finds what is not certain about a curve: Curve::Doubts.
#include <algorithm>
#include <cmath>

#include "motion/Curve.h"
#include "motion/CurveTangents.h"

namespace motion {
namespace {

constexpr unsigned Bit(CurveDoubt doubt) { return static_cast<unsigned>(doubt); }

bool Written(const CurveData& curve, Side side, std::size_t key) {
  const CurveSide& from = side == Side::kIn ? curve.in : curve.out;
  return key >= from.firstTangent && key - from.firstTangent < from.tangents.size() &&
         from.tangents[key - from.firstTangent].Written();
}

bool Holds(std::uint8_t type) { return type == tangent::kStep || type == tangent::kStepNext; }

unsigned TypeDoubts(const CurveData& curve, Side side, std::size_t key) {
  const std::uint8_t type = TangentType(curve, side, key);
  if (Written(curve, side, key)) {
    const Tangent written = TangentAt(curve, side, key);
    const bool empty = written.x == 0.0 && written.y == 0.0;
    return side == Side::kOut && type == tangent::kFixed && empty ? Bit(CurveDoubt::kFixedEmptyOutTangent)
                                                                  : 0u;
  }
  switch (type) {
    case tangent::kLinear:
    case tangent::kFlat:
    case tangent::kSpline:
    case tangent::kClamped:
    case tangent::kPlateau:
    case tangent::kAuto:
    case tangent::kAutoEase:
      return 0;
    case tangent::kFixed:
      return Bit(CurveDoubt::kFixedWithoutTangent);
    case tangent::kAutoMix:
      return Bit(CurveDoubt::kAutoMix);
    case tangent::kStep:
    case tangent::kStepNext:
      return Bit(CurveDoubt::kStepInTangent);  // on the way out it holds the span, which is certain
    default:
      return Bit(CurveDoubt::kTangentType);
  }
}

// Whether the handle of a fixed tangent on that side of a key leaves the values of the span there.
bool FixedHandleOvershoots(const CurveData& curve, Side side, std::size_t key) {
  if (TangentType(curve, side, key) != tangent::kFixed || !Written(curve, side, key)) return false;
  const CurveKey& here = curve.keys[key];
  const CurveKey& other = side == Side::kIn ? curve.keys[key - 1] : curve.keys[key + 1];
  const Tangent tangent = TangentAt(curve, side, key);
  const double rise = curve.weighted ? tangent.y : Slope(tangent) * std::fabs(other.time - here.time);
  const double handle = here.value + (side == Side::kIn ? -rise : rise) / 3.0;
  return handle < std::min(here.value, other.value) || handle > std::max(here.value, other.value);
}

unsigned PlateauDoubt(const CurveData& curve, std::size_t key) {
  bool sloping = false;
  for (const Side side : {Side::kIn, Side::kOut}) {
    sloping = sloping || (TangentType(curve, side, key) == tangent::kPlateau && !Written(curve, side, key) &&
                          Slope(TangentAt(curve, side, key)) != 0.0);
  }
  const bool beside =
      FixedHandleOvershoots(curve, Side::kOut, key - 1) || FixedHandleOvershoots(curve, Side::kIn, key + 1);
  return sloping && beside ? Bit(CurveDoubt::kPlateauBesideOvershoot) : 0u;
}

bool Known(int infinity) {
  return infinity == infinity::kConstant || infinity == infinity::kLinear || infinity == infinity::kCycle ||
         infinity == infinity::kCycleWithOffset || infinity == infinity::kOscillate;
}

unsigned InfinityDoubts(const CurveData& curve, Side side) {
  const int code = side == Side::kIn ? curve.preInfinity : curve.postInfinity;
  const std::size_t end = side == Side::kIn ? 0 : curve.keys.size() - 1;
  if (!Known(code)) return Bit(CurveDoubt::kInfinityCode);
  if (code == infinity::kConstant) return 0;
  if (curve.keys.size() == 1) return Bit(CurveDoubt::kInfinityOfOneKey);
  const bool linear = code == infinity::kLinear && TangentType(curve, side, end) == tangent::kLinear;
  return linear && !Written(curve, side, end) ? Bit(CurveDoubt::kLinearInfinityAtLinear) : 0u;
}

}  // namespace

unsigned Curve::Doubts() const {
  const std::size_t count = data_.keys.size();
  if (count == 0) return 0;
  unsigned doubts = InfinityDoubts(data_, Side::kIn) | InfinityDoubts(data_, Side::kOut);
  for (std::size_t key = 0; key + 1 < count; ++key) {
    if (Holds(TangentType(data_, Side::kOut, key))) continue;
    doubts |= TypeDoubts(data_, Side::kOut, key) | TypeDoubts(data_, Side::kIn, key + 1);
    if (key > 0) doubts |= PlateauDoubt(data_, key);
  }
  constexpr int kFirstQuaternion = 3;
  if (data_.rotationInterpolation >= kFirstQuaternion && count > 1) {
    doubts |= Bit(CurveDoubt::kRotationInterpolation);
  }
  return doubts;
}

}  // namespace motion
