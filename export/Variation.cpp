#include "export/Variation.h"

#include <algorithm>
#include <cmath>
#include <iterator>

namespace interchange {
namespace {

// A scale that comes from a matrix is slightly uneven by rounding.
bool IsClose(double a, double b) {
  constexpr double kRounding = 1e-9;
  return std::fabs(a - b) <= kRounding * std::fabs(b);
}

}  // namespace

bool Varies(const Channel& channel, std::size_t frames) {
  if (!channel.moves()) return false;
  const double first = channel.at(0);
  for (std::size_t frame = 1; frame < frames; ++frame) {
    if (channel.at(frame) != first) return true;
  }
  return false;
}

bool Varies(const Channel (&channels)[3], std::size_t frames) {
  return std::any_of(std::begin(channels), std::end(channels),
                     [&](const Channel& channel) { return Varies(channel, frames); });
}

bool RotationVaries(const Layer& layer, std::size_t frames) {
  if (Varies(layer.rotation, frames)) return true;
  return layer.aimed && (Varies(layer.position, frames) || Varies(layer.interest, frames));
}

bool IsScaledUnevenly(const Layer& layer, std::size_t frames) {
  const bool moves = std::any_of(std::begin(layer.scale), std::end(layer.scale),
                                 [](const Channel& channel) { return channel.moves(); });
  for (std::size_t frame = 0; frame < (moves ? frames : 1); ++frame) {
    const double x = layer.scale[0].at(frame);
    if (!(x > 0.0) || !IsClose(layer.scale[1].at(frame), x) || !IsClose(layer.scale[2].at(frame), x))
      return true;
  }
  return false;
}

}  // namespace interchange
