#include "bake/Sampler.h"

#include <algorithm>
#include <cmath>
#include <iterator>

#include "bake/PlainForm.h"
#include "motion/Transform.h"
#include "scene/Attributes.h"

namespace bake {
namespace {

constexpr double kDegrees = 57.29577951308232;  // in a radian

// Channels from a matrix count as level where they differ only by rounding.
constexpr double kMatrixRounding = 1e-12;

static_assert(scene::kPlaceChannels.size() == kSlotCount);  // a slot is a place in this list

bool IsRotation(std::size_t slot) { return slot >= kRotateX && slot <= kRotateZ; }

// Whether a constraint gives one of the angles. Its angles jump by a whole turn where they pass half a turn.
bool IsTurnedByConstraint(const scene::Scene& scene, scene::NodeId node) {
  const auto first = scene::kPlaceChannels.begin();
  return std::any_of(first + kRotateX, first + kRotateZ + 1, [&](std::string_view channel) {
    const auto driver = scene.SourceOf(scene.PlugOf(node, channel));
    return driver && scene.node(driver->plug.node).type.ends_with("Constraint");
  });
}

// The angle, in degrees, shifted by whole turns so that it is nearest to that of the frame before.
double NextTo(double before, double angle) {
  constexpr double kTurn = 360.0;
  return angle - kTurn * std::round((angle - before) / kTurn);
}

double LargestMagnitude(const Channel& channel) {
  double largest = 0.0;
  for (const double value : channel.values) largest = std::max(largest, std::fabs(value));
  return largest;
}

bool AllFinite(const Channel& channel) {
  return std::all_of(channel.values.begin(), channel.values.end(), [](double v) { return std::isfinite(v); });
}

}  // namespace

std::size_t Sampler::AddLocal(scene::NodeId node) {
  Source source;
  if (IsPlain(evaluator_->scene(), node)) {
    for (std::size_t slot = 0; slot < kSlotCount; ++slot) {
      source.numbers[slot] = evaluator_->Number(node, scene::kPlaceChannels[slot]);
    }
    source.turned = IsTurnedByConstraint(evaluator_->scene(), node);
  } else {
    source.matrix = evaluator_->InParent(node);
  }
  sources_.push_back(source);
  tracks_.emplace_back();
  return tracks_.size() - 1;
}

std::size_t Sampler::AddWorld(scene::NodeId node, bool scaled) {
  Source source;
  source.matrix = evaluator_->World(node);
  source.scaled = scaled;
  sources_.push_back(source);
  tracks_.emplace_back();
  return tracks_.size() - 1;
}

std::vector<motion::Evaluator::Wanted> Sampler::Wanted() const {
  std::vector<motion::Evaluator::Wanted> wanted;
  for (const Source& source : sources_) {
    if (source.matrix) {
      wanted.push_back({{}, {*source.matrix}});
    } else {
      wanted.push_back({{source.numbers.begin(), source.numbers.end()}, {}});
    }
  }
  for (const LensSource& source : lensSources_) wanted.push_back({source.camera.Numbers(), {}});
  return wanted;
}

// Samples all frames of one part, then those of the next one: the values of a part stay in the processor's
// caches.
void Sampler::Run(const FrameRange& frames) {
  const std::vector<std::uint32_t> partOf = evaluator_->Split(Wanted());
  std::vector<Part> parts(evaluator_->partCount());
  for (std::size_t i = 0; i < tracks_.size(); ++i) parts[partOf[i]].tracks.push_back(i);
  for (std::size_t i = 0; i < lenses_.size(); ++i) parts[partOf[tracks_.size() + i]].lenses.push_back(i);
  for (std::uint32_t part = 0; part < parts.size(); ++part) {
    const std::size_t count = part == motion::Evaluator::kStill ? 1 : frames.count;
    MakeRoom(parts[part], count);
    for (std::size_t frame = 0; frame < count; ++frame) {
      evaluator_->MoveTo(frames.Frame(frame) * unitsPerFrame_, part);
      SampleFrame(parts[part], frame == 0);
    }
  }
  Finish();
}

void Sampler::MakeRoom(const Part& part, std::size_t frames) {
  for (const std::size_t i : part.tracks) {
    for (std::size_t slot = 0; slot < kSlotCount; ++slot) {
      const bool moves = sources_[i].matrix ? evaluator_->Moves(*sources_[i].matrix)
                                            : evaluator_->Moves(sources_[i].numbers[slot]);
      if (moves) tracks_[i].channels[slot].values.reserve(frames);
    }
  }
  for (const std::size_t i : part.lenses) {
    if (lensSources_[i].camera.Moves()) lenses_[i].focalLength.values.reserve(frames);
  }
}

void Sampler::Finish() {
  for (std::size_t i = 0; i < tracks_.size(); ++i) {
    for (Channel& channel : tracks_[i].channels) {
      tracks_[i].finite = tracks_[i].finite && AllFinite(channel);
      Settle(&channel, sources_[i].matrix ? kMatrixRounding * LargestMagnitude(channel) : 0.0);
    }
  }
  for (LensTrack& lens : lenses_) Settle(&lens.focalLength);
}

void Sampler::SampleFrame(const Part& part, bool first) {
  for (const std::size_t i : part.tracks) {
    if (!sources_[i].matrix) {
      SampleNumbers(sources_[i], first, &tracks_[i]);
    } else if (first || evaluator_->Moves(*sources_[i].matrix)) {
      SampleMatrix(&sources_[i], &tracks_[i]);
    }
  }
  for (const std::size_t i : part.lenses) {
    if (first || lensSources_[i].camera.Moves()) SampleLens(&lensSources_[i], &lenses_[i]);
  }
}

void Sampler::SampleNumbers(const Source& source, bool first, Track* track) {
  const double degrees = evaluator_->measures().radians * kDegrees;
  const bool inDegrees = std::fabs(degrees - 1.0) < kMatrixRounding;
  for (std::size_t slot = 0; slot < kSlotCount; ++slot) {
    if (!first && !evaluator_->Moves(source.numbers[slot])) continue;
    std::vector<double>& values = track->channels[slot].values;
    double value = evaluator_->Value(source.numbers[slot]);
    if (IsRotation(slot)) {
      if (!inDegrees) value *= degrees;
      if (source.turned && !values.empty()) value = NextTo(values.back(), value);
    }
    values.push_back(value);
  }
}

void Sampler::SampleMatrix(Source* source, Track* track) {
  motion::Matrix matrix = evaluator_->Value(*source->matrix);
  if (!motion::IsFinite(matrix)) {
    track->finite = false;
    matrix = {};
  }
  track->mirrors = track->mirrors || motion::Determinant(motion::WithoutOrigin(matrix)) < 0.0;
  track->skew = std::max(track->skew, motion::Skew(matrix));
  motion::MatrixParts parts;
  if (source->scaled) {
    parts = motion::TakeApart(matrix, source->angles);
  } else {
    track->unevenness = std::max(track->unevenness, motion::Unevenness(matrix));
    parts = {matrix.origin, motion::ViewAngles(matrix, source->angles), {1.0, 1.0, 1.0}, {}};
  }
  source->angles = parts.rotate;
  for (int axis = 0; axis < 3; ++axis) {
    const auto place = static_cast<std::size_t>(axis);
    track->channels[kTranslateX + place].values.push_back(parts.translate[axis]);
    track->channels[kRotateX + place].values.push_back(parts.rotate[axis] * kDegrees);
    track->channels[kScaleX + place].values.push_back(parts.scale[axis]);
  }
}

std::vector<motion::Kept> Sampler::KeptOfTrack(std::size_t number, const motion::KeptBelow& below) const {
  const Source& source = sources_[number];
  if (source.matrix) return below.Of({}, {*source.matrix});
  return below.Of({source.numbers.begin(), source.numbers.end()}, {});
}

std::vector<motion::Kept> Sampler::KeptOfLens(std::size_t number, const motion::KeptBelow& below) const {
  return below.Of(lensSources_[number].camera.Numbers(), {});
}

}  // namespace bake
