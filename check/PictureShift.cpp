// How far the picture of an import is from the scene's.
#include <algorithm>
#include <cmath>
#include <optional>
#include <string>

#include "check/ImportedPicture.h"
#include "check/PointsPerUnit.h"
#include "check/RulesInternal.h"
#include "check/Times.h"
#include "motion/Evaluator.h"
#include "motion/SceneCamera.h"
#include "text/Numbers.h"

namespace check {
namespace {

using motion::Matrix;
using motion::Vector;

// A smaller shift is not seen.
constexpr double kSmallestShift = 0.5;

// More frames of a camera, and more layers times frames of all cameras, are not looked at.
constexpr double kMostFrames = 100'000;
constexpr double kMostSteps = 4'000'000;

constexpr double kDistanceWithoutInterest = 100.0;

struct Frames {
  double first = 1.0;
  double last = 1.0;
};

class Shift {
 public:
  Shift(const Subject& subject, const Camera& camera)
      : subject_(subject),
        camera_(camera),
        evaluator_(subject.scene, &subject.diagnostics),
        lens_(&evaluator_, camera.shape),
        world_(evaluator_.World(camera.shape)),
        interest_(evaluator_.Number(camera.shape, "centerOfInterest")),
        picture_(motion::PictureOf(subject.settings)),
        imported_(
            subject.cameOver, *camera.layer,
            subject.cameOver.distancesConverted ? PointsPerUnit(subject.scene.linearUnit().word) : 1.0) {}

  // Takes what it costs off the steps that are left.
  void Report(double* steps) {
    const Frames frames = FramesOf();
    const double count = frames.last - frames.first + 1.0;
    const double cost = count * static_cast<double>(imported_.layers());
    if (!(count <= kMostFrames) || !(cost <= *steps)) return;
    *steps -= cost;
    const double start = FirstKey(subject_, camera_).value_or(frames.first);
    for (double frame = frames.first; frame <= frames.last; ++frame) {
      evaluator_.MoveTo(frame);
      imported_.MoveTo((frame - start) / subject_.measures.framesPerSecond);
      TakeIn(frame);
    }
    Say();
  }

 private:
  // What the scene plays and all keys, outward to whole frames.
  Frames FramesOf() const {
    std::optional<double> first = FirstKey(subject_, camera_);
    std::optional<double> last = LastKey(subject_, camera_);
    if (const auto& playback = subject_.settings.playback) {
      first = std::min(first.value_or(playback->value.first), playback->value.first);
      last = std::max(last.value_or(playback->value.last), playback->value.last);
    }
    if (!first || !last) return {};
    return {std::floor(*first + 1e-6), std::ceil(*last - 1e-6)};
  }

  // The points of the scene's picture at the frame, and where the import shows them.
  void TakeIn(double frame) {
    const Matrix& place = evaluator_.Value(world_);
    if (!motion::IsFinite(place)) return;
    Matrix toWorld = motion::RotationOf(place);
    toWorld.origin = place.origin;
    const motion::Camera camera = lens_.Now();
    const motion::FilmWindow window = motion::FilmWindowOf(camera, picture_);
    const bool written = subject_.scene.Written(camera_.shape, "centerOfInterest").has_value();
    const double distance = written ? evaluator_.Value(interest_) : kDistanceWithoutInterest;
    const double perInch = distance * motion::kMillimetresPerInch / motion::EffectiveFocalLength(camera);
    if (!(distance > 0.0) || !std::isfinite(perInch)) return;
    for (const double u : {0.0, 0.5, 1.0}) {
      for (const double v : {0.0, 0.5, 1.0}) {
        const Vector point{(window.centreX + (u - 0.5) * window.width) * perInch,
                           (window.centreY + (v - 0.5) * window.height) * perInch, -distance};
        Compare(u, v, motion::TransformPoint(point, toWorld), frame);
      }
    }
  }

  void Compare(double u, double v, const Vector& point, double frame) {
    motion::PicturePoint landed{};
    double way = INFINITY;
    if (imported_.Project(point, &landed)) {
      way = std::hypot((landed.u - u) * picture_.width, (landed.v - v) * picture_.height);
    }
    if (!(way > largest_)) return;
    largest_ = way;
    frame_ = frame;
  }

  void Say() {
    if (largest_ < kSmallestShift) return;
    const double whole = std::hypot(picture_.width, picture_.height);
    const std::string way =
        largest_ > whole ? "more than the whole picture" : text::RoundedNumber(largest_) + " pixels";
    const scene::Node& node = subject_.scene.node(camera_.shape);
    subject_.diagnostics.Report(diag::Code::PictureShifts, node.place,
                                {node.name, way, text::RoundedNumber(frame_)});
  }

  const Subject& subject_;
  const Camera& camera_;
  motion::Evaluator evaluator_;
  motion::SceneCamera lens_;
  motion::MatrixId world_;
  motion::NumberId interest_;
  motion::Picture picture_;
  ImportedPicture imported_;
  double largest_ = 0.0;
  double frame_ = 0.0;
};

}  // namespace

void ReportShifts(const Subject& subject) {
  if (subject.cameOver.stop != Stop::None || !subject.cameOver.composition) return;
  double steps = kMostSteps;
  for (const Camera& camera : subject.cameras) {
    if (camera.layer != nullptr) Shift(subject, camera).Report(&steps);
  }
}

}  // namespace check
