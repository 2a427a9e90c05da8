// An animation curve: its value at any time.
#pragma once

#include <cstddef>

#include "motion/CurveData.h"
#include "motion/CurveSpan.h"

namespace motion {

// Properties of a curve for which the rules of the program that wrote the scene are not certain. Bits.
enum class CurveDoubt : unsigned {
  kTangentType = 1u << 0,             // slow, fast, or no legal type: taken as spline
  kStepInTangent = 1u << 1,           // a step on the way into a key: taken as flat
  kAutoMix = 1u << 2,                 // the rule is known, the code only likely
  kFixedWithoutTangent = 1u << 3,     // a fixed key without its tangent: taken as spline
  kFixedEmptyOutTangent = 1u << 4,    // a fixed tangent (0, 0) at the start of a span: taken as flat
  kInfinityCode = 1u << 5,            // no known code: taken as constant
  kInfinityOfOneKey = 1u << 6,        // the key's value is used
  kLinearInfinityAtLinear = 1u << 7,  // taken as level
  kPlateauBesideOvershoot = 1u << 8,  // beside a fixed handle that overshoots: taken by the rule
  kRotationInterpolation = 1u << 9,   // the three curves of a rotation belong together: evaluated one by one
};

// Remembers the last span that was evaluated, so that a sweep over ascending times takes constant time for
// each step. A cursor is used with one curve only, and does not refer to it.
class CurveCursor {
 private:
  friend class Curve;
  static constexpr std::size_t kNone = static_cast<std::size_t>(-1);

  std::size_t key_ = 0;         // the key on the left
  std::size_t spanOf_ = kNone;  // the key that span_ begins at
  CurveSpan span_;
};

// Immutable; threads may share one, each with its own cursor.
class Curve {
 public:
  // Keys in any order are sorted; of keys at one time the last one stays; keys that are not finite are
  // dropped.
  explicit Curve(CurveData data);

  // The value in the unit of the keys' values; at a key's time it is exactly the key's. 0 without keys.
  double At(double seconds) const;
  double At(double seconds, CurveCursor* cursor) const;

  // The curve as it is evaluated. Lives as long as the curve.
  const CurveData& Data() const { return data_; }

  // The CurveDoubt bits that apply, added up.
  unsigned Doubts() const;

 private:
  double Inside(double seconds, CurveCursor* cursor) const;
  double Outside(double seconds, CurveCursor* cursor) const;
  double Repeated(int code, double distance, bool after, CurveCursor* cursor) const;
  std::size_t FindSpan(double seconds, std::size_t hint) const;

  CurveData data_;
};

}  // namespace motion
