// The lens of a camera at each frame, in the values that the importer takes: focal length and aperture.
#include <cmath>

#include "bake/Sampler.h"

namespace bake {
namespace {

bool IsUsable(double value) { return std::isfinite(value) && value > 0.0; }

// Sets the side that fills the picture, and the apertures. *window is the aperture of that side, to which the
// focal lengths refer.
void FixAperture(const motion::Camera& camera, const motion::Picture& picture, LensTrack* lens,
                 double* window) {
  lens->vertical = motion::ResolvedFit(camera, picture) == motion::filmfit::kVertical;
  lens->horizontalAperture = camera.horizontalAperture * camera.lensSqueeze;
  lens->verticalAperture = camera.verticalAperture;
  lens->usable = IsUsable(lens->horizontalAperture) && IsUsable(lens->verticalAperture);
  *window = lens->vertical ? lens->verticalAperture : lens->horizontalAperture;
}

}  // namespace

std::size_t Sampler::AddLens(scene::NodeId camera) {
  lensSources_.push_back({motion::SceneCamera(evaluator_, camera)});
  lenses_.emplace_back();
  return lenses_.size() - 1;
}

// Side and aperture are those of the first frame. Where the picture shows another part of the film later, the
// focal length is changed to give the same picture.
void Sampler::SampleLens(LensSource* source, LensTrack* lens) {
  const motion::Camera camera = source->camera.Now();
  const motion::FilmWindow window = motion::FilmWindowOf(camera, picture_);
  if (lens->focalLength.values.empty()) FixAperture(camera, picture_, lens, &source->window);
  const double shown = lens->vertical ? window.height : window.width;
  const double focal = motion::EffectiveFocalLength(camera);
  lens->focalLength.values.push_back(shown == source->window ? focal : focal * (source->window / shown));
  lens->usable = lens->usable && IsUsable(shown) && IsUsable(lens->focalLength.values.back());
  lens->offset = lens->offset || window.centreX != 0.0 || window.centreY != 0.0;
  lens->squeezed = lens->squeezed || camera.lensSqueeze != 1.0;
  lens->otherEffects = lens->otherEffects || source->camera.HasFurtherChanges(picture_);
}

}  // namespace bake
