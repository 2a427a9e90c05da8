#include "scene/Units.h"

#include <charconv>
#include <system_error>

namespace scene {
namespace {

struct LinearWord {
  std::string_view longWord;
  std::string_view shortWord;
  double centimeters;
};

constexpr LinearWord kLinearWords[] = {
    {"millimeter", "mm", 0.1}, {"centimeter", "cm", 1}, {"meter", "m", 100},   {"kilometer", "km", 100000},
    {"inch", "in", 2.54},      {"foot", "ft", 30.48},   {"yard", "yd", 91.44}, {"mile", "mi", 160934.4},
};

struct TimeWord {
  std::string_view word;
  FrameRate rate;
};

constexpr TimeWord kTimeWords[] = {
    {"game", {15, 1}},
    {"film", {24, 1}},
    {"pal", {25, 1}},
    {"ntsc", {30, 1}},
    {"show", {48, 1}},
    {"palf", {50, 1}},
    {"ntscf", {60, 1}},
    {"sec", {1, 1}},
    {"min", {1, 60}},
    {"hour", {1, 3600}},
    {"millisec", {1000, 1}},
    {"23.976fps", {24000, 1001}},
    {"29.97fps", {30000, 1001}},
    {"29.97df", {30000, 1001}},
    {"47.952fps", {48000, 1001}},
    {"59.94fps", {60000, 1001}},
};

constexpr std::int64_t kMostFrames = 1000000;

}  // namespace

std::optional<double> LinearUnitOf(std::string_view word) {
  for (const LinearWord& entry : kLinearWords) {
    if (word == entry.longWord || word == entry.shortWord) return entry.centimeters;
  }
  return std::nullopt;
}

std::optional<AngularUnit> AngularUnitOf(std::string_view word) {
  if (word == "degree" || word == "deg") return AngularUnit::Degree;
  if (word == "radian" || word == "rad") return AngularUnit::Radian;
  return std::nullopt;
}

std::optional<FrameRate> TimeUnitOf(std::string_view word) {
  for (const TimeWord& entry : kTimeWords) {
    if (word == entry.word) return entry.rate;
  }
  constexpr std::string_view kFps = "fps";
  if (word.size() <= kFps.size() || word.substr(word.size() - kFps.size()) != kFps) return std::nullopt;
  const char* const end = word.data() + word.size() - kFps.size();
  std::int64_t frames = 0;
  const auto [at, error] = std::from_chars(word.data(), end, frames);
  if (error != std::errc() || at != end || frames < 1 || frames > kMostFrames) return std::nullopt;
  return FrameRate{frames, 1};
}

}  // namespace scene
