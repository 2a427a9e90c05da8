// The words of currentUnit.
#pragma once

#include <cstdint>
#include <optional>
#include <string_view>

namespace scene {

// Centimetres in one unit: "centimeter" or "cm", "inch" or "in" … None for any other word.
std::optional<double> LinearUnitOf(std::string_view word);

enum class AngularUnit : std::uint8_t { Degree, Radian };
std::optional<AngularUnit> AngularUnitOf(std::string_view word);

// Frames a second, as a fraction. An hour is 1/3600.
struct FrameRate {
  std::int64_t frames;
  std::int64_t seconds;

  double perSecond() const { return static_cast<double>(frames) / static_cast<double>(seconds); }
  bool operator==(const FrameRate&) const = default;
};

// "film" is 24, "23.976fps" is 24000/1001, "millisec" is 1000. Any whole number of frames up to a million
// before "fps" is taken, known or not.
std::optional<FrameRate> TimeUnitOf(std::string_view word);

}  // namespace scene
