// The numbers of a glTF file for each frame: floats, the lowest byte first.
#include <array>
#include <bit>
#include <cmath>
#include <numbers>

#include "export/GltfInternal.h"
#include "export/Places.h"

namespace interchange {
namespace {

// Gathers floats into large pieces, and remembers whether each number fitted a float.
class FloatStream {
 public:
  explicit FloatStream(std::ostream& out) : out_(out) {}

  void Put(double value) {
    fits_ = fits_ && FitsFloat(value);
    const auto bits = std::bit_cast<std::uint32_t>(FitsFloat(value) ? static_cast<float>(value) : 0.0f);
    for (const unsigned shift : {0u, 8u, 16u, 24u})
      piece_[used_++] = static_cast<char>((bits >> shift) & 0xffu);
    if (used_ == piece_.size()) Flush();
  }

  void Flush() {
    out_.write(piece_.data(), static_cast<std::streamsize>(used_));
    used_ = 0;
  }

  bool fits() const { return fits_; }

 private:
  std::ostream& out_;
  std::array<char, 1U << 14U> piece_{};
  std::size_t used_ = 0;
  bool fits_ = true;
};

void PutThree(FloatStream& out, const Channel (&channels)[3], std::size_t frames, double factor) {
  for (std::size_t frame = 0; frame < frames; ++frame) {
    for (const Channel& channel : channels) out.Put(channel.at(frame) * factor);
  }
}

// Each rotation has the sign that is nearer to the previous one, so that a program turns the short way
// between two frames.
void PutRotations(FloatStream& out, const Composition& composition, const Layer& layer) {
  Quaternion before;
  for (std::size_t frame = 0; frame < composition.frames; ++frame) {
    const Quaternion rotation = Nearest(LocalPlaceAt(composition, layer, frame).rotation, before);
    for (const double part : {rotation.x, rotation.y, rotation.z, rotation.w}) out.Put(part);
    before = rotation;
  }
}

void PutTrack(FloatStream& out, const Composition& composition, const GltfTrack& track) {
  const Layer& layer = composition.layers[track.layer];
  switch (track.path) {
    case GltfPath::Translation:
      return PutThree(out, layer.position, composition.frames, composition.metersPerUnit);
    case GltfPath::Rotation:
      return PutRotations(out, composition, layer);
    case GltfPath::Scale:
      return PutThree(out, layer.scale, composition.frames, 1.0);
    case GltfPath::Zoom:
      break;
  }
  for (std::size_t frame = 0; frame < composition.frames; ++frame) {
    out.Put(VerticalRadians(composition, layer.lens->zoom.at(frame)));
  }
}

bool AreFloats(const Channel (&channels)[3], double factor) {
  for (const Channel& channel : channels) {
    if (!FitsFloat(channel.at(0) * factor)) return false;
  }
  return true;
}

// Above 0 and below half a turn, also when it is rounded to a float.
bool IsAngle(double radians) {
  return static_cast<float>(radians) >= std::numeric_limits<float>::min() &&
         static_cast<double>(static_cast<float>(radians)) < std::numbers::pi;
}

bool AreAngles(const Composition& composition, const Channel& zoom) {
  for (std::size_t frame = 0; frame < (zoom.moves() ? composition.frames : 1); ++frame) {
    if (!IsAngle(VerticalRadians(composition, zoom.at(frame)))) return false;
  }
  return true;
}

bool IsRatio(double ratio) { return FitsFloat(ratio) && ratio >= std::numeric_limits<float>::min(); }

}  // namespace

bool GltfTakesStill(const Composition& composition, diag::Collector* diagnostics) {
  bool takes = true;
  for (const Layer& layer : composition.layers) {
    if (!AreFloats(layer.position, composition.metersPerUnit) || !AreFloats(layer.scale, 1.0)) {
      diagnostics->Report(diag::Code::ExportNumberTooLarge, {}, {layer.name, "glTF"});
      takes = false;
    } else if (layer.kind == LayerKind::Camera && !(IsRatio(composition.width / composition.height) &&
                                                    AreAngles(composition, layer.lens->zoom))) {
      diagnostics->Report(diag::Code::ExportLensUnusable, {}, {layer.name});
      takes = false;
    }
  }
  return takes;
}

bool WriteGltfData(const GltfPlan& plan, std::ostream& out, diag::Collector* diagnostics) {
  if (plan.tracks().empty()) return true;
  FloatStream floats(out);
  for (std::size_t frame = 0; frame < plan.composition().frames; ++frame) floats.Put(plan.SecondsAt(frame));
  for (const GltfTrack& track : plan.tracks()) {
    PutTrack(floats, plan.composition(), track);
    if (floats.fits()) continue;
    diagnostics->Report(diag::Code::ExportNumberTooLarge, {},
                        {plan.composition().layers[track.layer].name, "glTF"});
    return false;
  }
  floats.Flush();
  return true;
}

}  // namespace interchange
