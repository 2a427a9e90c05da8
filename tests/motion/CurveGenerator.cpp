#include "tests/motion/CurveGenerator.h"

#include <cmath>

#include "tests/motion/Chance.h"

namespace testmotion {
namespace {

using motion::CurveData;
using motion::CurveKey;
using motion::CurveSide;
using motion::Tangent;

constexpr std::uint8_t kTypes[] = {0,  1,  1,  2,  3,  4,  5,  6,  7,  9,  9,
                                   10, 10, 16, 16, 17, 18, 18, 18, 27, 28, 99};
constexpr int kInfinities[] = {0, 0, 1, 2, 3, 4, 5};
constexpr double kUnits[] = {1.0, 0.017453292519943295, 100.0, 0.1};
constexpr double kRates[] = {12.0, 24.0, 25.0, 30000.0 / 1001.0, 80.0};

void AddKeys(CurveData* curve, Chance* chance) {
  const double rate = chance->Of(kRates);
  const int count = chance->OneIn(12) ? 1 : 2 + chance->Below(9);
  const double size = std::pow(10.0, chance->Between(-2.0, 3.0));
  const bool uneven = chance->OneIn(3);
  const int longest = chance->OneIn(3) ? 3 : 40;
  double frame = chance->Below(200) - 100;
  double value = chance->Between(-size, size);
  for (int key = 0; key < count; ++key) {
    curve->keys.push_back({frame / rate, value});
    frame += uneven ? chance->Between(0.3, longest) : 1 + chance->Below(longest);
    switch (chance->Below(6)) {
      case 0:
        break;  // level
      case 1:
        value += chance->Between(0.0, 0.12) / curve->internalUnits;  // on both sides of what counts as level
        break;
      case 2:
      case 3:
        value += chance->Between(0.0, size);
        break;
      default:
        value = chance->Between(-size, size);
    }
  }
}

// As the file has it: a unit vector, or three times the way to the handle.
Tangent GenerateTangent(const CurveData& curve, std::size_t key, bool in, Chance* chance) {
  if (chance->OneIn(12)) return {0.0, 0.0};
  const std::size_t other = in ? key - 1 : key + 1;
  const bool end = other >= curve.keys.size();
  const double length = end ? 1.0 : std::fabs(curve.keys[other].time - curve.keys[key].time);
  const double rise = end ? 1.0 : std::fabs(curve.keys[other].value - curve.keys[key].value);
  const double y = chance->Between(-2.0, 2.0) * (rise + chance->Between(0.0, 1.0)) * curve.internalUnits;
  if (curve.weighted) {
    constexpr double kReaches[][2] = {{0.0, 3.0}, {0.9, 1.1}, {2.0, 5.0}, {-1.0, 0.5}, {0.0, 0.1}};
    const auto& reach = kReaches[chance->Below(5)];
    return {chance->OneIn(20) ? 0.0 : chance->Between(reach[0], reach[1]) * length, y};
  }
  const double norm = std::hypot(length, y);
  return {length / norm, y / norm};
}

void AddSide(CurveData* curve, bool in, Chance* chance) {
  CurveSide& side = in ? curve->in : curve->out;
  const bool mixed = !chance->OneIn(3);
  const bool written = chance->OneIn(4);
  for (std::size_t key = 0; key < curve->keys.size(); ++key) {
    const std::uint8_t type = mixed ? chance->Of(kTypes) : curve->type;
    if (mixed) side.types.push_back(type);
    const bool fixed = type == motion::tangent::kFixed;
    const bool has = fixed ? !chance->OneIn(30) : written && !chance->OneIn(3);
    side.tangents.push_back(has ? GenerateTangent(*curve, key, in, chance) : Tangent{});
  }
  // The first ones need not be there at all.
  while (side.firstTangent < side.tangents.size() && !side.tangents[side.firstTangent].Written()) {
    ++side.firstTangent;
  }
  side.tangents.erase(side.tangents.begin(),
                      side.tangents.begin() + static_cast<std::ptrdiff_t>(side.firstTangent));
}

std::vector<double> GenerateTimes(const CurveData& curve, Chance* chance) {
  const std::vector<CurveKey>& keys = curve.keys;
  const double first = keys.front().time;
  const double last = keys.back().time;
  const double length = keys.size() > 1 ? last - first : 1.0;
  const auto anyKey = [&] {
    return keys[static_cast<std::size_t>(chance->Below(static_cast<int>(keys.size())))];
  };
  std::vector<double> times = {anyKey().time, anyKey().time + 0.9e-10, anyKey().time - 0.9e-10,
                               anyKey().time + 1.5e-10, anyKey().time - 1.5e-10};
  for (int i = 0; i < 12; ++i) times.push_back(chance->Between(first, last));
  for (int i = 0; i < 3; ++i) times.push_back(chance->Between(first - length, first));
  for (int i = 0; i < 3; ++i) times.push_back(chance->Between(last, last + length));
  times.push_back(chance->Between(last, last + 20.0 * length));
  times.push_back(chance->Between(first - 20.0 * length, first));
  times.push_back(last + length * (1 + chance->Below(5)));
  times.push_back(first - length * (1 + chance->Below(5)));
  return times;
}

}  // namespace

GeneratedCurve GenerateCurve(std::uint64_t seed) {
  Chance chance(seed);
  GeneratedCurve generated;
  CurveData& curve = generated.data;
  curve.internalUnits = chance.Of(kUnits);
  curve.type = chance.Of(kTypes);
  curve.weighted = chance.OneIn(2);
  curve.preInfinity = chance.Of(kInfinities);
  curve.postInfinity = chance.Of(kInfinities);
  AddKeys(&curve, &chance);
  AddSide(&curve, true, &chance);
  AddSide(&curve, false, &chance);
  generated.times = GenerateTimes(curve, &chance);
  return generated;
}

}  // namespace testmotion
