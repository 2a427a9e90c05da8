#include "tools/mayascene/ExportScene.h"

#include <algorithm>
#include <cmath>
#include <map>
#include <memory>
#include <string>
#include <unordered_map>
#include <utility>
#include <vector>

#include "check/PointsPerUnit.h"
#include "hostapi/CameraSuite.h"
#include "hostapi/LayerStreams.h"
#include "scene/Units.h"
#include "tools/mayascene/Quantities.h"
#include "tools/mayascene/StreamWords.h"

namespace mayascene {
namespace {

using interchange::Channel;

constexpr double kMetresPerCentimetre = 0.01;
constexpr double kMillimetresPerPoint = 25.4 / 72.0;
constexpr double kDefaultFilmWidth = 36.0;  // millimetres; it changes no picture
constexpr double kFrameTolerance = 1e-6;

double quotientOf(const HostRatio& ratio) {
  return static_cast<double>(ratio.numerator) / static_cast<double>(ratio.denominator);
}

// Whether all of the values are the same. `count` is at least 1.
bool isOne(std::size_t count, const auto& value) {
  const double first = value(0);
  for (std::size_t i = 1; i < count; ++i) {
    if (value(i) != first) return false;
  }
  return true;
}

std::vector<double> listOf(std::size_t count, const auto& value) {
  std::vector<double> list;
  list.reserve(count);
  for (std::size_t i = 0; i < count; ++i) list.push_back(value(i));
  return list;
}

// Makes the description of one composition.
class Describer {
 public:
  Describer(const refhost::Composition& inner, const LensExtrasByCamera& extras,
            const DescriptionOptions& options, double unitsPerPoint, interchange::Composition* made)
      : inner_(inner),
        extras_(extras),
        options_(options),
        made_(*made),
        length_(unitsPerPoint * options.scale) {}

  // `offset`: the frame of the composition that is the first to be described. `span`: from there to the last.
  void run(double offset, double span, diag::Collector* diagnostics) {
    offset_ = offset;
    span_ = span;
    std::unordered_map<const refhost::Layer*, std::size_t> places;
    for (const refhost::Layer* layer : inner_.layers) {
      if (layer->kind == refhost::LayerKind::Composition) continue;
      places.emplace(layer, made_.layers.size());
      betweenFrames_ = 0;
      made_.layers.push_back(layerOf(*layer));
      if (options_.keys) reportKeys(made_.layers.back(), diagnostics);
      if (betweenFrames_ != 0) {
        diagnostics->Report(diag::Code::ExportKeysBetweenFrames, {},
                            {layer->name, std::to_string(betweenFrames_)});
      }
    }
    if (options_.keys && !keyed_) diagnostics->Report(diag::Code::ExportNothingKeyed, {});
    for (const auto& [layer, place] : places) {
      const auto parent = places.find(layer->parent);
      if (parent != places.end()) made_.layers[place].parent = parent->second;
    }
  }

 private:
  // Y and Z point the other way in the host.
  double sign(std::size_t axis) const {
    return axis != 0 && options_.axes == interchange::Axes::Scene ? -1.0 : 1.0;
  }

  // The factors from a stream's components to the description's.
  double factor(std::int32_t stream, std::size_t component) const {
    switch (stream) {
      case HOST_STREAM_ANCHOR_POINT:
      case HOST_STREAM_POSITION:
        return sign(component) * length_;
      case HOST_STREAM_SCALE:
        return 0.01;
      case HOST_STREAM_ROTATION_Y:
      case HOST_STREAM_ROTATION_Z:
        return sign(1);
      default:
        return 1.0;
    }
  }

  // Percents are divided, not multiplied, so that 100 becomes exactly 1.
  double converted(std::int32_t stream, std::size_t component, double value) const {
    return stream == HOST_STREAM_SCALE ? value / 100.0 : value * factor(stream, component);
  }

  Channel::Places placesOf(const refhost::KeyTimes& times) {
    const std::vector<T_Time>& row = times;
    Channel::Places& places = places_[&row];
    if (places) return places;
    std::vector<double> frames;
    frames.reserve(row.size());
    for (const T_Time& time : row) {
      const double frame = framesAt(time, inner_.frameRate) - offset_;
      const double whole = std::nearbyint(frame);
      frames.push_back(std::fabs(frame - whole) < kFrameTolerance ? whole : frame);
    }
    return places = std::make_shared<const std::vector<double>>(std::move(frames));
  }

  // Whether there is a key at each frame of the description and nowhere else.
  bool areAllFrames(const std::vector<double>& places) const {
    if (places.size() != made_.frames) return false;
    for (std::size_t i = 0; i < places.size(); ++i) {
      if (places[i] != static_cast<double>(i)) return false;
    }
    return true;
  }

  Channel channelOf(const refhost::Stream& stream, std::size_t component) {
    if (stream.keyCount() == 0 || options_.keys) {
      return converted(stream.id, component, stream.value[component]);
    }
    const auto dimension = static_cast<std::size_t>(stream.dimension);
    const std::vector<double>& from = stream.keys->values;
    const auto value = [&](std::size_t key) {
      return converted(stream.id, component, from[key * dimension + component]);
    };
    if (isOne(stream.keyCount(), value)) return value(0);
    std::vector<double> values = listOf(stream.keyCount(), value);
    const Channel::Places places = placesOf(stream.keys->times);
    if (areAllFrames(*places)) return Channel(std::move(values));
    countBetween(*places);
    return Channel(places, std::move(values));
  }

  // Keys outside the chosen frames are not lost: the user left them out.
  void countBetween(const std::vector<double>& places) {
    const auto between = std::count_if(places.begin(), places.end(), [this](double place) {
      return place > 0.0 && place <= span_ && place != std::nearbyint(place);
    });
    betweenFrames_ = std::max(betweenFrames_, static_cast<std::size_t>(between));
  }

  void take(const refhost::Layer& layer, std::int32_t id, Channel* channels, std::size_t count) {
    const refhost::Stream* const stream = layer.findStream(id);
    if (stream == nullptr) return;
    for (std::size_t i = 0; i < count; ++i) channels[i] = channelOf(*stream, i);
  }

  interchange::Lens lensOf(const refhost::Layer& layer) {
    interchange::Lens lens;
    take(layer, HOST_STREAM_ZOOM, &lens.zoom, 1);
    const double film = layer.filmSize * kMillimetresPerPoint;
    const double aspect = made_.height / made_.width;
    if (layer.filmDirection == HOST_FILM_HORIZONTAL) {
      lens.filmWidth = film;
    } else {
      lens.filmWidth = layer.filmDirection == HOST_FILM_VERTICAL ? film / aspect : kDefaultFilmWidth;
    }
    lens.filmHeight = lens.filmWidth * aspect;
    const auto extras = extras_.find(layer.name);
    if (extras == extras_.end()) return lens;
    lens.squeeze = extras->second.squeeze;
    // Without a film size an offset has no known effect.
    if (layer.filmDirection != HOST_FILM_HORIZONTAL && layer.filmDirection != HOST_FILM_VERTICAL) return lens;
    lens.filmOffsetX = extras->second.filmOffsetX;
    lens.filmOffsetY = extras->second.filmOffsetY;
    return lens;
  }

  interchange::Layer layerOf(const refhost::Layer& layer) {
    interchange::Layer made;
    made.name = layer.name;
    take(layer, HOST_STREAM_POSITION, made.position, 3);
    take(layer, HOST_STREAM_ROTATION_X, &made.rotation[0], 1);
    take(layer, HOST_STREAM_ROTATION_Y, &made.rotation[1], 1);
    take(layer, HOST_STREAM_ROTATION_Z, &made.rotation[2], 1);
    take(layer, HOST_STREAM_SCALE, made.scale, 3);
    if (options_.keys) takeKeys(layer, &made.keys);
    if (layer.kind != refhost::LayerKind::Camera) return made;
    made.kind = interchange::LayerKind::Camera;
    made.aimed = layer.aimed;
    if (made.aimed) take(layer, HOST_STREAM_ANCHOR_POINT, made.interest, 3);
    made.lens = lensOf(layer);
    return made;
  }

  void takeKeys(const refhost::Layer& layer, std::vector<interchange::StreamKeys>* lists) {
    for (const StreamWords& words : kStreamWords) {
      const refhost::Stream* const stream = layer.findStream(words.id);
      if (stream == nullptr || stream->keyCount() == 0) continue;
      interchange::StreamKeys list;
      list.stream = layer.kind == refhost::LayerKind::Camera ? words.cameraName : words.name;
      list.components = static_cast<std::size_t>(stream->dimension);
      std::size_t first = 0;
      list.frames = listedFrames(stream->keys->times, &first);
      for (std::size_t i = 0; i < list.components; ++i)
        list.values[i] = listedValues(*stream, i, first, list.frames->size());
      lists->push_back(std::move(list));
    }
  }

  // The frames of the keys that are asked for, in the scene's own numbers, and which key is the first.
  Channel::Places listedFrames(const refhost::KeyTimes& times, std::size_t* first) {
    const Channel::Places places = placesOf(times);
    auto begin = places->begin(), end = places->end();
    if (options_.frames) {
      begin = std::lower_bound(begin, end, 0.0);
      end = std::upper_bound(begin, end, options_.frames->last - made_.firstFrame);
    }
    *first = static_cast<std::size_t>(begin - places->begin());
    const std::vector<T_Time>& row = times;
    Channel::Places& listed = listed_[&row];
    if (listed) return listed;
    std::vector<double> frames(begin, end);
    for (double& frame : frames) frame += made_.firstFrame;
    return listed = std::make_shared<const std::vector<double>>(std::move(frames));
  }

  Channel listedValues(const refhost::Stream& stream, std::size_t component, std::size_t first,
                       std::size_t count) const {
    const auto dimension = static_cast<std::size_t>(stream.dimension);
    const auto value = [&](std::size_t key) {
      return converted(stream.id, component, stream.keys->values[(first + key) * dimension + component]);
    };
    if (count == 0) return {};
    return isOne(count, value) ? Channel(value(0)) : Channel(listOf(count, value));
  }

  // Whether the list has any of the layer's keys.
  void reportKeys(const interchange::Layer& layer, diag::Collector* diagnostics) {
    if (layer.keys.empty()) return;
    keyed_ = true;
    const bool listed =
        std::any_of(layer.keys.begin(), layer.keys.end(),
                    [](const interchange::StreamKeys& list) { return !list.frames->empty(); });
    if (listed) return;
    diagnostics->Report(diag::Code::ExportNoKeysInFrames, {},
                        {layer.name, numberText(options_.frames->first), numberText(options_.frames->last)});
  }

  const refhost::Composition& inner_;
  const LensExtrasByCamera& extras_;
  const DescriptionOptions& options_;
  interchange::Composition& made_;
  double length_;
  double offset_ = 0.0;
  double span_ = 0.0;
  std::size_t betweenFrames_ = 0;
  bool keyed_ = false;  // a layer has keys, in the list or not
  std::map<const std::vector<T_Time>*, Channel::Places> places_;
  std::map<const std::vector<T_Time>*, Channel::Places> listed_;
};

// "frame 3 holds", "frames 1 to 10 hold"
std::string holdText(double first, double last) {
  if (first == last) return "frame " + numberText(first) + " holds";
  return "frames " + numberText(first) + " to " + numberText(last) + " hold";
}

// Frames before the first key of all layers and after the last one.
void reportHeldFrames(const interchange::Composition& made, const SceneNumbers& numbers,
                      diag::Collector* diagnostics) {
  if (!numbers.firstFrame || !numbers.lastFrame) return;
  const auto report = [&](double first, double last, const char* which, double key) {
    diagnostics->Report(diag::Code::ExportFramesHeld, {}, {holdText(first, last), which, numberText(key)});
  };
  const double end = made.FrameNumber(made.frames - 1);
  // How many of the frames lie before the first key, and how many up to the last one.
  const double before = std::ceil(*numbers.firstFrame - made.firstFrame - kFrameTolerance);
  const double kept = std::floor(*numbers.lastFrame - made.firstFrame + kFrameTolerance) + 1.0;
  if (before > 0.0)
    report(made.firstFrame, std::min(made.firstFrame + before - 1.0, end), "first", *numbers.firstFrame);
  if (kept < static_cast<double>(made.frames))
    report(made.firstFrame + std::max(kept, 0.0), end, "last", *numbers.lastFrame);
}

}  // namespace

std::optional<interchange::Composition> describe(const refhost::Folder& folder, const SceneNumbers& numbers,
                                                 std::int32_t linearUnits, const DescriptionOptions& options,
                                                 diag::Collector* diagnostics) {
  // Where there are two, the first holds the layers and the second one shows it.
  const refhost::Composition& inner = *folder.compositions.front();
  interchange::Composition made;
  made.name = inner.name;
  made.width = inner.width;
  made.height = inner.height;
  made.pixelAspect = quotientOf(folder.compositions.back()->pixelAspect);
  made.framesPerSecond = quotientOf(inner.frameRate);
  made.metersPerUnit = scene::LinearUnitOf(numbers.linearUnit).value_or(1.0) * kMetresPerCentimetre;
  made.axes = options.axes;

  const double start = numbers.firstFrame.value_or(1.0);
  made.firstFrame = options.frames ? options.frames->first : start;
  const double last = options.frames ? options.frames->last : numbers.lastFrame.value_or(start);
  const double frames = std::floor(last - made.firstFrame + kFrameTolerance) + 1.0;
  if (!options.keys && !(frames <= (options.frames ? kMostFrames : kMostFramesUnasked))) {
    diagnostics->Report(diag::Code::ExportTooManyFrames, {}, {numberText(made.firstFrame), numberText(last)});
    return std::nullopt;
  }
  made.frames = options.keys ? 1 : std::max<std::size_t>(1, static_cast<std::size_t>(std::max(frames, 1.0)));

  if (options.frames && !options.keys) reportHeldFrames(made, numbers, diagnostics);

  const double unitsPerPoint = linearUnits == 0 ? 1.0 : 1.0 / check::PointsPerUnit(numbers.linearUnit);
  Describer(inner, numbers.lenses, options, unitsPerPoint, &made)
      .run(made.firstFrame - start, last - made.firstFrame + kFrameTolerance, diagnostics);
  return made;
}

}  // namespace mayascene
