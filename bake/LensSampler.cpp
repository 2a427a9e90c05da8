// The lens of a camera at each frame, in what the importer takes: one focal length over one aperture.
#include <cmath>
#include <iterator>

#include "bake/Sampler.h"

namespace bake {
namespace {

// What is read of a camera; the order of LensSource.
enum LensNumber : std::size_t {
  kFocalLength,
  kHorizontalAperture,
  kVerticalAperture,
  kFilmFit,
  kLensSqueeze,
  kCameraScale,
  kHorizontalOffset,
  kVerticalOffset,
  kShakeEnabled,
  kHorizontalShake,
  kVerticalShake,
  kShakeOverscanEnabled,
  kShakeOverscan,
  kFirstNeutral,
};
constexpr std::string_view kNumbers[] = {
    "focalLength",   "horizontalFilmAperture", "verticalFilmAperture", "filmFit",      "lensSqueezeRatio",
    "cameraScale",   "horizontalFilmOffset",   "verticalFilmOffset",   "shakeEnabled", "horizontalShake",
    "verticalShake", "shakeOverscanEnabled",   "shakeOverscan",
};
static_assert(std::size(kNumbers) == kFirstNeutral);

// What changes the picture after the projection, and the value at which it does not.
struct Neutral {
  std::string_view attribute;
  double value;
};
constexpr Neutral kNeutrals[] = {
    {"preScale", 1.0},       {"postScale", 1.0},     {"filmTranslateH", 0.0},
    {"filmTranslateV", 0.0}, {"filmRollValue", 0.0}, {"filmFitOffset", 0.0},
};
constexpr std::size_t kFirstPan = kFirstNeutral + std::size(kNeutrals);
// The pan and zoom of the view, which is in the picture where both switches are on.
constexpr std::string_view kPanNumbers[] = {"panZoomEnabled", "renderPanZoom", "horizontalPan", "verticalPan",
                                            "zoom"};

bool IsUsable(double value) { return std::isfinite(value) && value > 0.0; }

}  // namespace

std::size_t Sampler::AddLens(scene::NodeId camera) {
  static_assert(kFirstPan + std::size(kPanNumbers) == kLensNumbers);
  LensSource source;
  std::size_t place = 0;
  for (const std::string_view name : kNumbers) source.numbers[place++] = evaluator_->Number(camera, name);
  for (const Neutral& neutral : kNeutrals) {
    source.numbers[place++] = evaluator_->Number(camera, neutral.attribute);
  }
  for (const std::string_view name : kPanNumbers) source.numbers[place++] = evaluator_->Number(camera, name);
  lensSources_.push_back(source);
  lenses_.emplace_back();
  return lenses_.size() - 1;
}

// The side that fills the picture and its aperture are those of the first frame. What the picture shows of
// the film at a later one becomes the focal length.
void Sampler::SampleLens(LensSource* source, LensTrack* lens) {
  const auto number = [&](std::size_t place) { return evaluator_->Value(source->numbers[place]); };
  motion::Camera camera;
  camera.focalLength = number(kFocalLength);
  camera.horizontalAperture = number(kHorizontalAperture);
  camera.verticalAperture = number(kVerticalAperture);
  camera.filmFit = static_cast<int>(std::lround(std::fmin(std::fmax(number(kFilmFit), 0.0), 4.0)));
  camera.lensSqueeze = number(kLensSqueeze);
  camera.cameraScale = number(kCameraScale);
  camera.horizontalOffset = number(kHorizontalOffset);
  camera.verticalOffset = number(kVerticalOffset);
  camera.hasShake = number(kShakeEnabled) != 0.0;
  camera.horizontalShake = number(kHorizontalShake);
  camera.verticalShake = number(kVerticalShake);
  camera.hasShakeOverscan = number(kShakeOverscanEnabled) != 0.0;
  camera.shakeOverscan = number(kShakeOverscan);

  const motion::FilmWindow window = motion::FilmWindowOf(camera, picture_);
  const bool first = lens->focalLength.values.empty();
  if (first) {
    lens->vertical = motion::ResolvedFit(camera, picture_) == motion::filmfit::kVertical;
    lens->horizontalAperture = camera.horizontalAperture * camera.lensSqueeze;
    lens->verticalAperture = camera.verticalAperture;
    source->window = lens->vertical ? lens->verticalAperture : lens->horizontalAperture;
  }
  const double shown = lens->vertical ? window.height : window.width;
  double focal = motion::EffectiveFocalLength(camera);
  if (shown != source->window) {
    focal *= source->window / shown;
    lens->movingAperture = true;
  }
  lens->focalLength.values.push_back(focal);
  lens->usable = lens->usable && IsUsable(focal) && IsUsable(shown) && IsUsable(lens->horizontalAperture) &&
                 IsUsable(lens->verticalAperture);
  lens->offset = lens->offset || window.centreX != 0.0 || window.centreY != 0.0;
  lens->squeezed = lens->squeezed || camera.lensSqueeze != 1.0;
  lens->scaled = lens->scaled || camera.cameraScale != 1.0;
  lens->resolvedFit = lens->resolvedFit || camera.filmFit == motion::filmfit::kFill ||
                      camera.filmFit == motion::filmfit::kOverscan;
  for (std::size_t i = 0; i < std::size(kNeutrals); ++i) {
    lens->otherEffects = lens->otherEffects || number(kFirstNeutral + i) != kNeutrals[i].value;
  }
  const bool panned = number(kFirstPan) != 0.0 && number(kFirstPan + 1) != 0.0;
  lens->otherEffects =
      lens->otherEffects || (panned && (number(kFirstPan + 2) != 0.0 || number(kFirstPan + 3) != 0.0 ||
                                        number(kFirstPan + 4) != 1.0));
}

}  // namespace bake
