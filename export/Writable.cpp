// The checks that hold for every format.
#include <algorithm>
#include <cmath>
#include <cstdint>
#include <iterator>
#include <vector>

#include "export/Format.h"

namespace interchange {
namespace {

using diag::Code;

// Sizes, rates and lenses outside these bounds are errors. What is computed from them might not be finite.
bool IsMeasure(double number) { return number >= kSmallestMeasure && number <= kLargestMeasure; }

bool AreSound(const Channel (&channels)[3], std::size_t frames) {
  return std::all_of(std::begin(channels), std::end(channels),
                     [&](const Channel& channel) { return channel.IsSound(frames); });
}

bool AreSound(const std::vector<StreamKeys>& keys) {
  return std::all_of(keys.begin(), keys.end(), [](const StreamKeys& stream) {
    const std::vector<double>& frames = *stream.frames;
    return AreSound(stream.values, frames.size()) &&
           std::all_of(frames.begin(), frames.end(), [](double frame) { return std::isfinite(frame); });
  });
}

// The name of the first value of a layer that is not sound; empty where all are.
std::string_view UnsoundPart(const Layer& layer, std::size_t frames) {
  if (!AreSound(layer.position, frames)) return "position";
  if (!AreSound(layer.rotation, frames)) return "rotation";
  if (!AreSound(layer.scale, frames)) return "scale";
  if (!AreSound(layer.interest, frames)) return "point of interest";
  if (layer.lens && !layer.lens->zoom.IsSound(frames)) return "zoom";
  return AreSound(layer.keys) ? "" : "keys";
}

bool IsUsable(const std::optional<double>& extra) { return !extra || std::isfinite(*extra); }

bool IsUsable(const Lens& lens, std::size_t frames) {
  if (!IsMeasure(lens.filmWidth) || !IsMeasure(lens.filmHeight)) return false;
  if (!IsUsable(lens.filmOffsetX) || !IsUsable(lens.filmOffsetY) || !IsUsable(lens.squeeze)) return false;
  const std::size_t looked = lens.zoom.moves() ? frames : 1;
  for (std::size_t frame = 0; frame < looked; ++frame) {
    if (!IsMeasure(lens.zoom.at(frame))) return false;
  }
  return true;
}

// Whether parents are layers, and the way up from each layer ends.
bool ParentsEnd(const std::vector<Layer>& layers) {
  enum class Mark : std::uint8_t { None, OnTheWay, Ends };
  std::vector<Mark> marks(layers.size(), Mark::None);
  std::vector<std::size_t> way;
  for (std::size_t start = 0; start < layers.size(); ++start) {
    way.clear();
    std::optional<std::size_t> at = start;
    while (at && *at < layers.size() && marks[*at] == Mark::None) {
      marks[*at] = Mark::OnTheWay;
      way.push_back(*at);
      at = layers[*at].parent;
    }
    if (at && (*at >= layers.size() || marks[*at] == Mark::OnTheWay)) return false;
    for (const std::size_t passed : way) marks[passed] = Mark::Ends;
  }
  return true;
}

bool IsPictureUsable(const Composition& composition) {
  return IsMeasure(composition.width) && IsMeasure(composition.height) &&
         IsMeasure(composition.pixelAspect) && IsMeasure(composition.framesPerSecond) &&
         IsMeasure(composition.metersPerUnit) && std::isfinite(composition.firstFrame) &&
         composition.frames != 0;
}

// Whether the numbers of all frames differ from each other, and fit a whole number of 64 bits.
bool AreFramesExact(const Composition& composition) {
  return std::fabs(composition.firstFrame) <= kLargestFrame - static_cast<double>(composition.frames);
}

bool IsLayerUsable(const Layer& layer, std::size_t frames, diag::Collector* diagnostics) {
  const std::string_view unsound = UnsoundPart(layer, frames);
  if (!unsound.empty()) {
    diagnostics->Report(Code::ExportNotFinite, {}, {layer.name, unsound});
    return false;
  }
  if (layer.kind != LayerKind::Camera || (layer.lens && IsUsable(*layer.lens, frames))) return true;
  diagnostics->Report(Code::ExportLensUnusable, {}, {layer.name});
  return false;
}

}  // namespace

bool IsWritable(const Composition& composition, diag::Collector* diagnostics) {
  if (!IsPictureUsable(composition)) {
    diagnostics->Report(Code::ExportPictureUnusable, {});
    return false;
  }
  if (!AreFramesExact(composition)) {
    diagnostics->Report(Code::ExportTimesTooFine, {}, {"any format"});
    return false;
  }
  bool usable = true;
  for (const Layer& layer : composition.layers) {
    usable = IsLayerUsable(layer, composition.frames, diagnostics) && usable;
  }
  if (ParentsEnd(composition.layers)) return usable;
  diagnostics->Report(Code::ExportParentCircle, {});
  return false;
}

}  // namespace interchange
