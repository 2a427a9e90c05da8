// Which values of a composition go into a glTF file for each frame, and at which times.
#include "export/GltfInternal.h"
#include "export/Variation.h"

namespace interchange {
namespace {

// Times are rounded to floats. A program shows a frame too early or too late by at most this part of a frame.
constexpr double kMostOfAFrame = 1e-3;

// The number of the first frame in the file. Times may not be below 0, and far from 0 they are rounded too
// much: such a file counts from its first frame.
double StartOf(const Composition& composition) {
  const double last = composition.FrameNumber(composition.frames - 1);
  constexpr double kRounding = 0.5 * std::numeric_limits<float>::epsilon();
  return composition.firstFrame >= 0.0 && last * kRounding <= kMostOfAFrame ? composition.firstFrame : 0.0;
}

}  // namespace

std::size_t GltfTrack::components() const {
  return path == GltfPath::Zoom ? 1 : path == GltfPath::Rotation ? 4 : 3;
}

std::string_view GltfTrack::type() const {
  return path == GltfPath::Zoom ? "SCALAR" : path == GltfPath::Rotation ? "VEC4" : "VEC3";
}

GltfPlan::GltfPlan(const Composition& composition) : composition_(composition), start_(StartOf(composition)) {
  std::size_t cameras = 0;
  for (std::size_t index = 0; index < composition.layers.size(); ++index) {
    const Layer& layer = composition.layers[index];
    const std::size_t frames = composition.frames;
    if (Varies(layer.position, frames)) tracks_.push_back({index, cameras, GltfPath::Translation});
    if (RotationVaries(layer, frames)) tracks_.push_back({index, cameras, GltfPath::Rotation});
    if (Varies(layer.scale, frames)) tracks_.push_back({index, cameras, GltfPath::Scale});
    if (layer.kind != LayerKind::Camera) continue;
    if (Varies(layer.lens->zoom, frames)) tracks_.push_back({index, cameras, GltfPath::Zoom});
    ++cameras;
  }
}

double GltfPlan::SecondsAt(std::size_t frame) const {
  return (start_ + static_cast<double>(frame)) / composition_.framesPerSecond;
}

bool GltfPlan::TimesRise() const {
  if (tracks_.empty()) return true;
  if (!FitsFloat(SecondsAt(composition_.frames - 1))) return false;
  for (std::size_t frame = 1; frame < composition_.frames; ++frame) {
    if (!(static_cast<float>(SecondsAt(frame)) > static_cast<float>(SecondsAt(frame - 1)))) return false;
  }
  return true;
}

std::uint64_t GltfPlan::TimesSize() const {
  return tracks_.empty() ? 0 : composition_.frames * sizeof(float);
}

std::uint64_t GltfPlan::SizeOf(const GltfTrack& track) const {
  return composition_.frames * track.components() * sizeof(float);
}

std::uint64_t GltfPlan::DataSize() const {
  std::uint64_t size = TimesSize();
  for (const GltfTrack& track : tracks_) size += SizeOf(track);
  return size;
}

}  // namespace interchange
