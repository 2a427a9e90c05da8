// An animation curve as a scene writes it.
//
// Times are seconds. Values are in a unit of the caller's choice; `internalUnits` says how many internal
// units (centimetres, radians, or 1 for plain numbers) one of them is. Tangents are always in seconds and
// internal units, as in the file. For a driven key "time" is the driving number.
#pragma once

#include <cmath>
#include <cstddef>
#include <cstdint>
#include <limits>
#include <vector>

namespace motion {

struct CurveKey {
  double time;
  double value;
};

// Codes of tangents, as they stand in the file. Every other code counts as none.
namespace tangent {
constexpr std::uint8_t kNone = 0;
constexpr std::uint8_t kFixed = 1;
constexpr std::uint8_t kLinear = 2;
constexpr std::uint8_t kFlat = 3;
constexpr std::uint8_t kUnset = 4;  // what the file has where it writes no type; no legal type
constexpr std::uint8_t kStep = 5;
constexpr std::uint8_t kSlow = 6;
constexpr std::uint8_t kFast = 7;
constexpr std::uint8_t kSpline = 9;
constexpr std::uint8_t kClamped = 10;
constexpr std::uint8_t kPlateau = 16;
constexpr std::uint8_t kStepNext = 17;
constexpr std::uint8_t kAuto = 18;
constexpr std::uint8_t kAutoMix = 27;
constexpr std::uint8_t kAutoEase = 28;
}  // namespace tangent

// Codes of what a curve does before the first key and after the last one. Every other code counts as
// constant.
namespace infinity {
constexpr int kConstant = 0;
constexpr int kLinear = 1;
constexpr int kCycle = 3;
constexpr int kCycleWithOffset = 4;
constexpr int kOscillate = 5;
}  // namespace infinity

// The direction of a curve beside a key. Where tangents are weighted, x and y are three times the distance
// from the key to the handle; elsewhere only y / x counts.
struct Tangent {
  double x = std::numeric_limits<double>::quiet_NaN();  // not a number: the file writes none
  double y = 0.0;

  bool Written() const { return !std::isnan(x); }
};

// Types and tangents on one side of the keys. Mostly empty: files write few of them.
struct CurveSide {
  std::vector<std::uint8_t> types;  // by key; a key beyond the end has the curve's type
  std::size_t firstTangent = 0;     // the key of tangents[0]
  std::vector<Tangent> tangents;    // by key; a key outside has no written tangent
};

struct CurveData {
  std::vector<CurveKey> keys;
  double internalUnits = 1.0;  // in one unit of a key's value; finite and positive
  std::uint8_t type = tangent::kUnset;
  CurveSide in;
  CurveSide out;
  bool weighted = true;
  int preInfinity = infinity::kConstant;
  int postInfinity = infinity::kConstant;
  int rotationInterpolation = 1;
};

}  // namespace motion
