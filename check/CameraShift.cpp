#include "check/CameraShift.h"

#include <cmath>
#include <string>

#include "check/PointsPerUnit.h"
#include "check/Times.h"
#include "text/Numbers.h"

namespace check {
namespace {

using motion::Matrix;
using motion::Vector;

// A smaller shift is not seen.
constexpr double kSmallestShift = 0.5;

constexpr double kDistanceWithoutInterest = 100.0;

double UnitOf(const Subject& subject) {
  return subject.cameOver.distancesConverted ? PointsPerUnit(subject.scene.linearUnit().word) : 1.0;
}

// A scene that counts frames begins with its first key. One that does not keeps its times.
double StartOf(const Subject& subject, const Camera& camera) {
  return CountsFrames(subject.scene) ? FirstKey(subject, camera).value_or(0.0) : 0.0;
}

}  // namespace

CameraShift::CameraShift(const Subject& subject, const Camera& camera, motion::Evaluator* evaluator,
                         motion::Evaluator* interests)
    : subject_(subject),
      camera_(camera),
      evaluator_(*evaluator),
      interests_(*interests),
      lens_(evaluator, camera.shape),
      world_(evaluator->World(camera.shape)),
      interest_(interests->Number(camera.shape, "centerOfInterest")),
      picture_(motion::PictureOf(subject.settings)),
      imported_(subject.cameOver, *camera.layer, UnitOf(subject)),
      start_(StartOf(subject, camera)) {}

bool CameraShift::Moves() const {
  return evaluator_.Moves(world_) || lens_.Moves() || interests_.Moves(interest_) || imported_.Moves();
}

// The points of the scene's picture at the frame, and where the import shows them.
void CameraShift::TakeIn(double frame, double time) {
  changed_ = changed_ || lens_.HasFurtherChanges(picture_);
  const Matrix& place = evaluator_.Value(world_);
  if (!motion::IsFinite(place)) return;
  Matrix toWorld = motion::RotationOf(place);
  toWorld.origin = place.origin;
  const motion::Camera camera = lens_.Now();
  const motion::FilmWindow window = motion::FilmWindowOf(camera, picture_);
  const bool known =
      interests_.Moves(interest_) || subject_.scene.Written(camera_.shape, "centerOfInterest").has_value();
  const double distance = known ? interests_.Value(interest_) : kDistanceWithoutInterest;
  const double perInch = distance * motion::kMillimetresPerInch / motion::EffectiveFocalLength(camera);
  if (!(distance > 0.0) || !std::isfinite(perInch)) return;
  seen_ = true;
  imported_.MoveTo((time - start_) / subject_.measures.framesPerSecond);
  for (const double u : {0.0, 0.5, 1.0}) {
    for (const double v : {0.0, 0.5, 1.0}) {
      const Vector point{(window.centreX + (u - 0.5) * window.width) * perInch,
                         (window.centreY + (v - 0.5) * window.height) * perInch, -distance};
      Compare(u, v, motion::TransformPoint(point, toWorld), frame);
    }
  }
}

void CameraShift::Compare(double u, double v, const Vector& point, double frame) {
  motion::PicturePoint landed{};
  double way = INFINITY;
  if (imported_.Project(point, &landed)) {
    way = std::hypot((landed.u - u) * picture_.width, (landed.v - v) * picture_.height);
  }
  if (way > largest_.pixels) largest_ = {way, frame};
}

std::optional<LargestShift> CameraShift::Report() const {
  const scene::Node& node = subject_.scene.node(camera_.shape);
  if (changed_) ReportPictureChange(subject_, camera_.shape);
  if (!seen_) {
    subject_.diagnostics.Report(
        diag::Code::ShiftNotMeasured, node.place,
        {node.name, "its place, its lens or its centre of interest is no usable number"});
    return std::nullopt;
  }
  if (largest_.pixels < kSmallestShift) return largest_;
  const double whole = std::hypot(picture_.width, picture_.height);
  const std::string way = largest_.pixels > whole ? "more than the whole picture"
                                                  : text::RoundedNumber(largest_.pixels) + " pixels";
  subject_.diagnostics.Report(diag::Code::PictureShifts, node.place,
                              {node.name, way, text::RoundedNumber(largest_.frame)});
  return largest_;
}

}  // namespace check
