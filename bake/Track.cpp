#include "bake/Track.h"

#include <algorithm>
#include <cmath>

namespace bake {
namespace {

// A scale nearer to 1 than this comes from rounding.
constexpr double kScaleTolerance = 1e-9;

// The cosine of two axes that count as square to each other.
constexpr double kSquare = 1e-9;

}  // namespace

bool Track::moves() const {
  return std::any_of(channels.begin(), channels.end(),
                     [](const Channel& channel) { return channel.moves(); });
}

bool Track::IsSheared() const { return skew > kSquare; }

bool Track::IsUneven() const { return unevenness > 1.0 + kScaleTolerance; }

bool Track::IsScaled() const {
  for (const std::size_t slot : {kScaleX, kScaleY, kScaleZ}) {
    for (const double value : channels[slot].values) {
      if (std::fabs(value - 1.0) > kScaleTolerance) return true;
    }
  }
  return false;
}

void Settle(Channel* channel, double tolerance) {
  std::vector<double>& values = channel->values;
  const double first = values.front();
  const bool level = std::all_of(values.begin(), values.end(), [&](double value) {
    return value == first || std::fabs(value - first) <= tolerance;
  });
  if (!level) return;
  values.resize(1);
  values.shrink_to_fit();
}

}  // namespace bake
