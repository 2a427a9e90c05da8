#include "motion/CurveTangents.h"

#include <algorithm>
#include <cmath>

namespace motion {
namespace {

constexpr double kClampedDifference = 0.05;  // internal units
constexpr double kSteepest = 3.0;            // times the flatter of the two neighbouring spans

const CurveSide& SideOf(const CurveData& curve, Side side) {
  return side == Side::kIn ? curve.in : curve.out;
}

Tangent WrittenTangent(const CurveData& curve, Side side, std::size_t key) {
  const CurveSide& written = SideOf(curve, side);
  if (key < written.firstTangent || key - written.firstTangent >= written.tangents.size()) return {};
  Tangent tangent = written.tangents[key - written.firstTangent];
  tangent.y /= curve.internalUnits;
  return tangent;
}

// A key between two others: the slopes that the rules use.
struct Neighbourhood {
  double before;     // slope of the span before the key
  double after;      // slope of the span after it
  double across;     // slope from neighbour to neighbour
  double share;      // of the time from neighbour to neighbour that lies before the key
  bool nearlyLevel;  // one of the neighbours has nearly the key's value
};

Neighbourhood LookAround(const CurveData& curve, std::size_t key) {
  const CurveKey& previous = curve.keys[key - 1];
  const CurveKey& here = curve.keys[key];
  const CurveKey& next = curve.keys[key + 1];
  const auto level = [&curve](double difference) {
    return std::fabs(difference) * curve.internalUnits <= kClampedDifference;
  };
  return {(here.value - previous.value) / (here.time - previous.time),
          (next.value - here.value) / (next.time - here.time),
          (next.value - previous.value) / (next.time - previous.time),
          (here.time - previous.time) / (next.time - previous.time),
          level(here.value - previous.value) || level(next.value - here.value)};
}

bool Rises(const Neighbourhood& at) { return at.before > 0.0 && at.after > 0.0; }
bool Falls(const Neighbourhood& at) { return at.before < 0.0 && at.after < 0.0; }
double Limit(const Neighbourhood& at) {
  return kSteepest * std::min(std::fabs(at.before), std::fabs(at.after));
}

// Flat at an extreme and beside a level span; never so steep that the curve would overshoot a neighbour.
double Held(double slope, const Neighbourhood& at) {
  if (!Rises(at) && !Falls(at)) return 0.0;
  return std::clamp(slope, -Limit(at), Limit(at));
}

double Mixed(double shareOfAfter, const Neighbourhood& at) {
  return (1.0 - shareOfAfter) * at.before + shareOfAfter * at.after;
}

double EasedShare(double share) {
  const double fromMiddle = share - 0.5;
  return 0.5 + fromMiddle * (1.5 - 2.0 * fromMiddle * fromMiddle);
}

double InnerSlope(std::uint8_t type, Side side, const Neighbourhood& at) {
  switch (type) {
    case tangent::kLinear:
      return side == Side::kIn ? at.before : at.after;
    case tangent::kFlat:
    case tangent::kStep:
    case tangent::kStepNext:
      return 0.0;
    case tangent::kClamped:
      return at.nearlyLevel ? 0.0 : at.across;
    case tangent::kPlateau:
      return (Rises(at) || Falls(at)) && std::fabs(at.across) <= Limit(at) ? at.across : 0.0;
    case tangent::kAuto:
      return Held(at.across, at);
    case tangent::kAutoEase:
      return Held(Mixed(EasedShare(at.share), at), at);
    case tangent::kAutoMix:
      return Held(Mixed(at.share, at), at);
    default:
      return at.across;
  }
}

// The slope of the first or the last key. `facesSpan`: the side of the key where the curve is.
double EndSlope(const CurveData& curve, std::uint8_t type, std::size_t key, bool facesSpan) {
  const std::size_t left = key == 0 ? 0 : key - 1;
  const CurveKey& first = curve.keys[left];
  const CurveKey& second = curve.keys[left + 1];
  const double difference = second.value - first.value;
  const double slope = difference / (second.time - first.time);
  switch (type) {
    case tangent::kLinear:
      return facesSpan ? slope : 0.0;
    case tangent::kFlat:
    case tangent::kStep:
    case tangent::kStepNext:
    case tangent::kPlateau:
    case tangent::kAuto:
    case tangent::kAutoEase:
    case tangent::kAutoMix:
      return 0.0;
    case tangent::kClamped:
      return std::fabs(difference) * curve.internalUnits <= kClampedDifference ? 0.0 : slope;
    default:
      return slope;
  }
}

}  // namespace

std::uint8_t TangentType(const CurveData& curve, Side side, std::size_t key) {
  const std::vector<std::uint8_t>& types = SideOf(curve, side).types;
  return key < types.size() ? types[key] : curve.type;
}

Tangent TangentAt(const CurveData& curve, Side side, std::size_t key) {
  const Tangent written = WrittenTangent(curve, side, key);
  if (written.Written()) return written;
  const std::size_t count = curve.keys.size();
  if (count < 2) return {1.0, 0.0};
  const std::uint8_t type = TangentType(curve, side, key);
  const bool first = key == 0;
  const bool last = key + 1 == count;
  const bool facesSpan = side == Side::kIn ? !first : !last;
  const double slope =
      first || last ? EndSlope(curve, type, key, facesSpan) : InnerSlope(type, side, LookAround(curve, key));
  if (!facesSpan) return {1.0, slope};
  const std::size_t left = side == Side::kIn ? key - 1 : key;
  const double length = curve.keys[left + 1].time - curve.keys[left].time;
  return {length, slope * length};
}

double Slope(const Tangent& tangent) { return tangent.x == 0.0 ? 0.0 : tangent.y / tangent.x; }

}  // namespace motion
