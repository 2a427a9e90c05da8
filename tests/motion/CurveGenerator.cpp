#include "tests/motion/CurveGenerator.h"

#include <cmath>

#include "tests/support/SplitMix.h"

namespace testmotion {
namespace {

using motion::CurveData;
using motion::CurveKey;
using motion::CurveSide;
using motion::Tangent;

class Dice {
 public:
  explicit Dice(std::uint64_t seed) : state_(seed) {}

  double Between(double low, double high) {
    constexpr double kUnit = 0x1p-53;
    return low + (high - low) * static_cast<double>(testsupport::SplitMix(&state_) >> 11) * kUnit;
  }
  int Below(int count) {
    return static_cast<int>(testsupport::SplitMix(&state_) % static_cast<unsigned>(count));
  }
  bool OneIn(int count) { return Below(count) == 0; }
  template <typename T, std::size_t kCount>
  T Of(const T (&choices)[kCount]) {
    return choices[Below(static_cast<int>(kCount))];
  }

 private:
  std::uint64_t state_;
};

constexpr std::uint8_t kTypes[] = {0,  1,  1,  2,  3,  4,  5,  6,  7,  9,  9,
                                   10, 10, 16, 16, 17, 18, 18, 18, 27, 28, 99};
constexpr int kInfinities[] = {0, 0, 1, 2, 3, 4, 5};
constexpr double kUnits[] = {1.0, 0.017453292519943295, 100.0, 0.1};
constexpr double kRates[] = {12.0, 24.0, 25.0, 30000.0 / 1001.0, 80.0};

void AddKeys(CurveData* curve, Dice* dice) {
  const double rate = dice->Of(kRates);
  const int count = dice->OneIn(12) ? 1 : 2 + dice->Below(9);
  const double size = std::pow(10.0, dice->Between(-2.0, 3.0));
  const bool uneven = dice->OneIn(3);
  const int longest = dice->OneIn(3) ? 3 : 40;
  double frame = dice->Below(200) - 100;
  double value = dice->Between(-size, size);
  for (int key = 0; key < count; ++key) {
    curve->keys.push_back({frame / rate, value});
    frame += uneven ? dice->Between(0.3, longest) : 1 + dice->Below(longest);
    switch (dice->Below(6)) {
      case 0:
        break;  // level
      case 1:
        value += dice->Between(0.0, 0.12) / curve->internalUnits;  // on both sides of what counts as level
        break;
      case 2:
      case 3:
        value += dice->Between(0.0, size);
        break;
      default:
        value = dice->Between(-size, size);
    }
  }
}

// As the file has it: a unit vector, or three times the way to the handle.
Tangent GenerateTangent(const CurveData& curve, std::size_t key, bool in, Dice* dice) {
  if (dice->OneIn(12)) return {0.0, 0.0};
  const std::size_t other = in ? key - 1 : key + 1;
  const bool end = other >= curve.keys.size();
  const double length = end ? 1.0 : std::fabs(curve.keys[other].time - curve.keys[key].time);
  const double rise = end ? 1.0 : std::fabs(curve.keys[other].value - curve.keys[key].value);
  const double y = dice->Between(-2.0, 2.0) * (rise + dice->Between(0.0, 1.0)) * curve.internalUnits;
  if (curve.weighted) {
    constexpr double kReaches[][2] = {{0.0, 3.0}, {0.9, 1.1}, {2.0, 5.0}, {-1.0, 0.5}, {0.0, 0.1}};
    const auto& reach = kReaches[dice->Below(5)];
    return {dice->OneIn(20) ? 0.0 : dice->Between(reach[0], reach[1]) * length, y};
  }
  const double norm = std::hypot(length, y);
  return {length / norm, y / norm};
}

void AddSide(CurveData* curve, bool in, Dice* dice) {
  CurveSide& side = in ? curve->in : curve->out;
  const bool mixed = !dice->OneIn(3);
  const bool written = dice->OneIn(4);
  for (std::size_t key = 0; key < curve->keys.size(); ++key) {
    const std::uint8_t type = mixed ? dice->Of(kTypes) : curve->type;
    if (mixed) side.types.push_back(type);
    const bool fixed = type == motion::tangent::kFixed;
    const bool has = fixed ? !dice->OneIn(30) : written && !dice->OneIn(3);
    side.tangents.push_back(has ? GenerateTangent(*curve, key, in, dice) : Tangent{});
  }
  // The first ones need not be there at all.
  while (side.firstTangent < side.tangents.size() && !side.tangents[side.firstTangent].Written()) {
    ++side.firstTangent;
  }
  side.tangents.erase(side.tangents.begin(),
                      side.tangents.begin() + static_cast<std::ptrdiff_t>(side.firstTangent));
}

std::vector<double> GenerateTimes(const CurveData& curve, Dice* dice) {
  const std::vector<CurveKey>& keys = curve.keys;
  const double first = keys.front().time;
  const double last = keys.back().time;
  const double length = keys.size() > 1 ? last - first : 1.0;
  const auto anyKey = [&] {
    return keys[static_cast<std::size_t>(dice->Below(static_cast<int>(keys.size())))];
  };
  std::vector<double> times = {anyKey().time, anyKey().time + 0.9e-10, anyKey().time - 0.9e-10,
                               anyKey().time + 1.5e-10, anyKey().time - 1.5e-10};
  for (int i = 0; i < 12; ++i) times.push_back(dice->Between(first, last));
  for (int i = 0; i < 3; ++i) times.push_back(dice->Between(first - length, first));
  for (int i = 0; i < 3; ++i) times.push_back(dice->Between(last, last + length));
  times.push_back(dice->Between(last, last + 20.0 * length));
  times.push_back(dice->Between(first - 20.0 * length, first));
  times.push_back(last + length * (1 + dice->Below(5)));
  times.push_back(first - length * (1 + dice->Below(5)));
  return times;
}

}  // namespace

GeneratedCurve GenerateCurve(std::uint64_t seed) {
  Dice dice(seed);
  GeneratedCurve generated;
  CurveData& curve = generated.data;
  curve.internalUnits = dice.Of(kUnits);
  curve.type = dice.Of(kTypes);
  curve.weighted = dice.OneIn(2);
  curve.preInfinity = dice.Of(kInfinities);
  curve.postInfinity = dice.Of(kInfinities);
  AddKeys(&curve, &dice);
  AddSide(&curve, true, &dice);
  AddSide(&curve, false, &dice);
  generated.times = GenerateTimes(curve, &dice);
  return generated;
}

}  // namespace testmotion
