#include "tools/mayascene/LayerSummary.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <string_view>
#include <vector>

#include "hostapi/CameraSuite.h"
#include "hostapi/LayerStreams.h"
#include "tools/mayascene/Quantities.h"
#include "tools/mayascene/StreamWords.h"

namespace mayascene {
namespace {

using refhost::Layer;
using refhost::Stream;

constexpr double kMillimetresPerPoint = 25.4 / 72.0;
constexpr std::string_view kGap = "   ";

// Millimetres of focal length for each pixel of zoom; 0 where the film or the picture has no size.
double focalLengthPerZoom(const Layer& camera) {
  if (camera.filmDirection == refhost::kFilmNeverSet) return 0.0;
  const auto pixels = static_cast<double>(
      camera.filmDirection == HOST_FILM_VERTICAL ? camera.composition->height : camera.composition->width);
  const double factor = camera.filmSize * kMillimetresPerPoint / pixels;
  return std::isfinite(factor) ? factor : 0.0;
}

// People name lenses in tenths of a millimetre.
std::string millimetresText(double value) { return numberText(std::round(value * 10.0) / 10.0); }

std::string rangeText(double least, double most, std::string (*text)(double)) {
  const std::string first = text(least), last = text(most);
  return first == last ? first : fmt::format("{} to {}", first, last);
}

// Keys replace the static value.
std::string lensText(const Layer& camera) {
  const Stream* const zoom = camera.findStream(HOST_STREAM_ZOOM);
  if (zoom == nullptr) return "";
  double least = zoom->value[0], most = least;
  if (zoom->keyCount() > 0) {
    const auto ends = std::minmax_element(zoom->keys->values.begin(), zoom->keys->values.end());
    least = *ends.first;
    most = *ends.second;
  }
  const double factor = focalLengthPerZoom(camera);
  if (factor == 0.0) return fmt::format("zoom {} px", rangeText(least, most, numberText));
  return fmt::format("lens {} mm", rangeText(least * factor, most * factor, millimetresText));
}

// The three rotations are one word.
std::string_view wordOf(const StreamWords& words, const Layer& layer) {
  const bool rotation = words.id == HOST_STREAM_ROTATION_X || words.id == HOST_STREAM_ROTATION_Y ||
                        words.id == HOST_STREAM_ROTATION_Z;
  if (rotation) return "rotation";
  return layer.kind == refhost::LayerKind::Camera ? words.cameraLabel : words.label;
}

std::string motionText(const Layer& layer) {
  std::vector<std::string_view> moving;
  const T_Time *first = nullptr, *last = nullptr;
  for (const StreamWords& words : kStreamWords) {
    const Stream* const stream = layer.findStream(words.id);
    if (stream == nullptr || isStill(*stream)) continue;
    const refhost::KeyTimes& times = stream->keys->times;
    if (first == nullptr || isEarlier(times.front(), *first)) first = &times.front();
    if (last == nullptr || isEarlier(*last, times.back())) last = &times.back();
    const std::string_view word = wordOf(words, layer);
    if (moving.empty() || moving.back() != word) moving.push_back(word);
  }
  if (moving.empty()) return "still";
  return fmt::format("{} animated, {}", fmt::join(moving, ", "),
                     spanText(*first, *last, layer.composition->frameRate));
}

}  // namespace

std::string layerSummary(const Layer& layer) {
  std::string text = layer.kind == refhost::LayerKind::Camera ? lensText(layer) : "";
  if (!text.empty()) text += kGap;
  return text + motionText(layer);
}

}  // namespace mayascene
