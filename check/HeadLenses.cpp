// The values that the driven lenses of a scene take over its frames.
#include <algorithm>
#include <cmath>
#include <deque>
#include <numbers>
#include <optional>

#include "check/HeadInternal.h"
#include "check/Times.h"
#include "motion/Evaluator.h"
#include "motion/FrameEnds.h"
#include "motion/KeptBelow.h"
#include "motion/SceneCamera.h"

namespace check {
namespace {

// More frames of a scene, and more frames of all its lenses, are not looked at.
constexpr double kMostFrames = 100'000;
constexpr double kMostSteps = 1'000'000;

void TakeIn(double value, std::optional<Span>* span) {
  if (!*span) *span = Span{value, value};
  if (value < (*span)->least) (*span)->least = value;
  if (value > (*span)->largest) (*span)->largest = value;
}

// One attribute of a lens that something drives.
struct DrivenNumber {
  std::optional<Span> LensOverFrames::*span;
  motion::NumberId number;
};

// One camera whose lens is driven. The evaluator must outlive it.
class DrivenLens {
 public:
  DrivenLens(const HeadSource& source, scene::NodeId shape, CameraHead* camera, motion::Evaluator* evaluator)
      : camera_(camera),
        evaluator_(*evaluator),
        lens_(evaluator, shape),
        picture_(motion::PictureOf(source.settings)) {
    Ask(shape, "focalLength", &LensOverFrames::focalLength);
    Ask(shape, "horizontalFilmAperture", &LensOverFrames::horizontalAperture);
    Ask(shape, "verticalFilmAperture", &LensOverFrames::verticalAperture);
    Ask(shape, "orthographicWidth", &LensOverFrames::orthographicWidth);
  }

  // The evaluator stands at a frame.
  void TakeInFrame() {
    for (const DrivenNumber& one : numbers_) TakeIn(evaluator_.Value(one.number), &(values_.*one.span));
    TakeIn(AngleOfView(lens_.Now(), picture_), &values_.angleOfView);
  }

  // Call after all frames. A value that does not come from its driver is left empty.
  void Finish(const motion::FrameEnds& frames, const motion::KeptBelow& kept) {
    values_.first = frames.first;
    values_.last = frames.last;
    for (const DrivenNumber& one : numbers_) {
      if (!kept.Of({one.number}, {}).empty()) values_.*one.span = std::nullopt;
    }
    if (!kept.Of(lens_.Numbers(), {}).empty()) values_.angleOfView = std::nullopt;
    camera_->overFrames = values_;
  }

 private:
  void Ask(scene::NodeId shape, std::string_view attribute, std::optional<Span> LensOverFrames::*span) {
    const auto drives = [attribute](const Drive& drive) { return drive.channel == attribute; };
    if (std::any_of(camera_->drives.begin(), camera_->drives.end(), drives))
      numbers_.push_back({span, evaluator_.Number(shape, attribute)});
  }

  CameraHead* camera_;
  motion::Evaluator& evaluator_;
  motion::SceneCamera lens_;
  motion::Picture picture_;
  std::vector<DrivenNumber> numbers_;
  LensOverFrames values_;
};

// What is played, and all keys of the cameras: of their lenses and of their places. `places` is only asked,
// so that the places cost nothing at the frames.
motion::FrameEnds FramesOf(const HeadSource& source, const motion::Evaluator& lenses,
                           const motion::Evaluator& places) {
  std::vector<scene::NodeId> nodes = lenses.computingNodes();
  nodes.insert(nodes.end(), places.computingNodes().begin(), places.computingNodes().end());
  const auto played = PlayedFrames(source.scene, source.settings);
  return motion::FindFrameEnds(source.scene, played, nodes, source.measures).value_or(motion::FrameEnds{});
}

}  // namespace

double AngleOfView(const motion::Camera& camera, const motion::Picture& picture) {
  const double width = motion::FilmWindowOf(camera, picture).width * motion::kMillimetresPerInch;
  return 2.0 * std::atan(width / (2.0 * motion::EffectiveFocalLength(camera))) * 180.0 / std::numbers::pi;
}

void DescribeLensesOverFrames(const HeadSource& source, const std::vector<scene::NodeId>& shapes,
                              std::vector<CameraHead>* cameras) {
  const auto driven = [](const CameraHead& camera) { return !camera.drives.empty(); };
  if (std::none_of(cameras->begin(), cameras->end(), driven)) return;
  diag::Collector unreported(source.scene.text());
  motion::Evaluator evaluator(source.scene, &unreported);
  motion::Evaluator places(source.scene, &unreported);
  std::deque<DrivenLens> lenses;
  for (std::size_t i = 0; i < cameras->size(); ++i) {
    CameraHead& camera = (*cameras)[i];
    if (!driven(camera)) continue;
    lenses.emplace_back(source, shapes[i], &camera, &evaluator);
    places.World(shapes[i]);
  }
  const motion::FrameEnds frames = FramesOf(source, evaluator, places);
  const double count = frames.last - frames.first + 1.0;
  if (!(count <= kMostFrames) || !(count * static_cast<double>(lenses.size()) <= kMostSteps)) return;
  const double unitsPerFrame = motion::UnitsPerFrame(source.scene);
  for (double number = 0.0; number < count; ++number) {
    evaluator.MoveTo((frames.first + number) * unitsPerFrame);
    for (DrivenLens& lens : lenses) lens.TakeInFrame();
  }
  const motion::KeptBelow kept(evaluator);
  for (DrivenLens& lens : lenses) lens.Finish(frames, kept);
}

}  // namespace check
