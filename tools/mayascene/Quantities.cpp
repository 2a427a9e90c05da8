#include "tools/mayascene/Quantities.h"

#include <fmt/format.h>

#include <array>
#include <charconv>
#include <cmath>
#include <cstdint>
#include <string_view>
#include <vector>

namespace mayascene {
namespace {

constexpr int kDecimals = 3;
constexpr double kSmallestFixed = 0.0005;  // three decimals would show smaller values as 0
constexpr double kNoise = 1e-9;            // smaller values are 0 with rounding errors
constexpr double kLargestFixed = 1e15;
constexpr int kGeneralDigits = 6;

std::string digits(double value, std::chars_format format, int precision) {
  std::array<char, 64> text{};
  const std::to_chars_result end =
      std::to_chars(text.data(), text.data() + text.size(), value, format, precision);
  return std::string(text.data(), end.ptr);
}

std::string withoutTrailingZeros(std::string text) {
  if (text.find('.') == std::string::npos) return text;
  text.erase(text.find_last_not_of('0') + 1);
  if (text.back() == '.') text.pop_back();
  return text == "-0" ? "0" : text;
}

bool hasSeconds(const T_Time& time) { return time.scale != 0; }
double seconds(const T_Time& time) { return static_cast<double>(time.value) / time.scale; }

bool hasFrames(const T_Time& time, const HostRatio& rate) {
  return hasSeconds(time) && rate.denominator != 0 && rate.numerator > 0;
}

std::string frameText(const T_Time& time, const HostRatio& rate) {
  return numberText(seconds(time) * rate.numerator / rate.denominator);
}

std::string secondsText(const T_Time& time) {
  if (!hasSeconds(time)) return fmt::format("{}/0 s", time.value);
  return fmt::format("{} s", numberText(seconds(time)));
}

bool isSameTime(const T_Time& a, const T_Time& b) { return a.value == b.value && a.scale == b.scale; }

std::string secondsSpan(const T_Time& first, const T_Time& last) {
  if (isSameTime(first, last)) return secondsText(first);
  return fmt::format("{} to {}", secondsText(first), secondsText(last));
}

// Whether there are several keys, and all have the same value but for rounding noise.
bool isConstant(const refhost::Stream& stream) {
  const std::vector<double>& values = stream.keys->values;
  const auto dimension = static_cast<std::size_t>(stream.dimension);
  for (std::size_t i = dimension; i < values.size(); ++i) {
    const double difference = std::fabs(values[i] - values[i - dimension]);
    if (!(difference < kNoise)) return false;
  }
  return values.size() > dimension;
}

}  // namespace

std::string numberText(double value) {
  if (!std::isfinite(value)) return std::isnan(value) ? "nan" : value > 0 ? "inf" : "-inf";
  const double size = std::fabs(value);
  if (size < kNoise) return "0";
  if (size < kSmallestFixed) return digits(value, std::chars_format::general, kDecimals);
  if (size >= kLargestFixed) return digits(value, std::chars_format::general, kGeneralDigits);
  return withoutTrailingZeros(digits(value, std::chars_format::fixed, kDecimals));
}

std::string countText(std::size_t count, const std::string& thing) {
  return fmt::format("{} {}{}", count, thing, count == 1 ? "" : "s");
}

std::string ratioText(const HostRatio& ratio) {
  if (ratio.denominator == 0) return fmt::format("{}/0", ratio.numerator);
  return numberText(static_cast<double>(ratio.numerator) / ratio.denominator);
}

std::string durationText(const T_Time& duration, const HostRatio& rate) {
  if (!hasFrames(duration, rate)) return secondsText(duration);
  const std::string frames = frameText(duration, rate);
  return fmt::format("{} ({} {})", secondsText(duration), frames, frames == "1" ? "frame" : "frames");
}

std::string keysText(const refhost::Stream& stream, const HostRatio& rate) {
  const refhost::KeyColumns& keys = *stream.keys;
  const T_Time& first = keys.times.front();
  const T_Time& last = keys.times.back();
  const std::string span = secondsSpan(first, last);
  const std::string count = countText(keys.times.size(), "key");
  const char* const ending = isConstant(stream) ? ", constant" : "";
  if (!hasFrames(first, rate) || !hasFrames(last, rate)) return fmt::format("{}, {}{}", count, span, ending);
  return fmt::format("{}, {} ({}){}", count, spanText(first, last, rate), span, ending);
}

std::string spanText(const T_Time& first, const T_Time& last, const HostRatio& rate) {
  if (!hasFrames(first, rate) || !hasFrames(last, rate)) return secondsSpan(first, last);
  if (isSameTime(first, last)) return fmt::format("frame {}", frameText(first, rate));
  return fmt::format("frames {} to {}", frameText(first, rate), frameText(last, rate));
}

bool isEarlier(const T_Time& one, const T_Time& other) {
  return std::int64_t{one.value} * other.scale < std::int64_t{other.value} * one.scale;
}

bool isStill(const refhost::Stream& stream) { return stream.keyCount() < 2 || isConstant(stream); }

std::string valueText(const refhost::Stream& stream) {
  std::string text;
  for (std::int32_t axis = 0; axis < stream.dimension; ++axis) {
    if (axis > 0) text += ", ";
    text += numberText(stream.value[axis]);
  }
  return text;
}

}  // namespace mayascene
