// How far the picture of an import is from the scene's: which cameras are measured, and at which frames.
#include <algorithm>
#include <cmath>
#include <deque>
#include <limits>
#include <map>
#include <optional>
#include <string>
#include <vector>

#include "check/CameraShift.h"
#include "check/RulesInternal.h"
#include "check/Times.h"
#include "motion/Evaluator.h"
#include "motion/FrameEnds.h"
#include "motion/KeptBelow.h"

namespace check {
namespace {

// More frames of a scene, and more layers times frames of all cameras, are not looked at.
constexpr double kMostFrames = 100'000;
constexpr double kMostSteps = 1'000'000;

class Shifts {
 public:
  explicit Shifts(const Subject& subject)
      : subject_(subject),
        unreported_(subject.scene.text()),
        evaluated_(subject.scene.text(), std::numeric_limits<std::size_t>::max()),
        evaluator_(subject.scene, &evaluated_),
        interests_(subject.scene, &unreported_),
        unitsPerFrame_(motion::UnitsPerFrame(subject.scene)) {}

  std::map<scene::NodeId, LargestShift> Report() {
    for (const Camera& camera : subject_.cameras) Ask(camera);
    FindFrames();
    Measure();
    ReportEvaluation();
    ReportInfinities(subject_, frames_);
    const motion::KeptBelow kept(evaluator_);
    std::map<scene::NodeId, LargestShift> shifts;
    for (const CameraShift* const camera : measured_) {
      const std::vector<motion::Kept> unknown = camera->Unknown(kept);
      if (!unknown.empty()) {
        SayNotMeasured(camera->camera(), NameOf(unknown.front().plug) + " cannot be computed");
      } else if (const std::optional<LargestShift> shift = camera->Report()) {
        shifts[camera->camera().shape] = *shift;
      }
    }
    return shifts;
  }

 private:
  void SayNotMeasured(const Camera& camera, std::string_view why) const {
    const scene::Node& node = subject_.scene.node(camera.shape);
    subject_.diagnostics.Report(diag::Code::ShiftNotMeasured, node.place, {node.name, why});
  }

  std::string NameOf(const scene::Plug& plug) const {
    return '"' + std::string(subject_.scene.node(plug.node).name) + '.' + std::string(plug.attribute) + '"';
  }

  // What the evaluation found; of a driver that the import does not follow that has been said.
  void ReportEvaluation() const {
    using diag::Code;
    for (const diag::Diagnostic& one : evaluated_.kept()) {
      const bool ofDriver = one.code == Code::UnsupportedDriver || one.code == Code::DriverWithoutAnswer;
      if (ofDriver && subject_.driversSaid != nullptr && subject_.driversSaid->contains(one.range.offset))
        continue;
      subject_.diagnostics.Take(one);
    }
  }

  // Whether all layers of the camera were made: a stop leaves the last ones in the middle.
  bool CameWhole(const Camera& camera) const {
    if (camera.layer == nullptr) return false;
    const auto& layers = subject_.cameOver.layers;
    if (subject_.cameOver.stop == Stop::None) return true;
    const CameOverLayer* layer = camera.layer;
    for (std::size_t length = 0; length <= layers.size(); ++length) {
      if (layer == &layers.back()) return false;
      if (!layer->parent) return true;
      layer = &layers[*layer->parent];
    }
    return false;
  }

  void Ask(const Camera& camera) {
    if (!camera.taken) return;
    if (CameWhole(camera)) {
      cameras_.emplace_back(subject_, camera, &evaluator_, &interests_);
    }
  }

  // Those of the bake: what is played, and all keys of what the cameras depend on.
  void FindFrames() {
    frames_ = motion::FindFrameEnds(subject_.scene, PlayedFrames(subject_.scene, subject_.settings),
                                    evaluator_.computingNodes(), subject_.measures)
                  .value_or(motion::FrameEnds{});
    const double all = frames_.last - frames_.first + 1.0;
    double steps = kMostSteps;
    for (CameraShift& camera : cameras_) {
      const double count = camera.Moves() ? all : 1.0;
      const double cost = count * static_cast<double>(camera.layers());
      if (!(count <= kMostFrames)) {
        SayNotMeasured(camera.camera(), "the scene has more than 100000 frames");
      } else if (!(cost <= steps)) {
        SayNotMeasured(camera.camera(), "the scene has too many frames and layers");
      } else {
        steps -= cost;
        measured_.push_back(&camera);
      }
    }
  }

  // All frames of the cameras that depend on the same, then those of the others.
  void Measure() {
    std::vector<motion::Evaluator::Wanted> wanted;
    std::vector<motion::Evaluator::Wanted> interests;
    for (const CameraShift* const camera : measured_) {
      wanted.push_back(camera->Wanted());
      interests.push_back(camera->WantedOfInterest());
    }
    const std::vector<std::uint32_t> parts = evaluator_.Split(wanted);
    partOfInterest_ = interests_.Split(interests);
    std::vector<std::vector<std::size_t>> camerasOfPart(evaluator_.partCount());
    for (std::size_t i = 0; i < parts.size(); ++i) camerasOfPart[parts[i]].push_back(i);
    for (std::uint32_t part = 0; part < camerasOfPart.size(); ++part) {
      if (!camerasOfPart[part].empty()) MeasurePart(part, camerasOfPart[part]);
    }
  }

  // Of what stands still one frame shows all.
  void MeasurePart(std::uint32_t part, std::vector<std::size_t> cameras) {
    std::vector<double> frameOfInterest(interests_.partCount(), NAN);  // by part: where it stands
    for (double frame = frames_.first; frame <= frames_.last; ++frame) {
      const double time = frame * unitsPerFrame_;
      evaluator_.MoveTo(time, part);
      for (const std::size_t camera : cameras) {
        const std::uint32_t interest = partOfInterest_[camera];
        if (frameOfInterest[interest] != frame) interests_.MoveTo(time, interest);
        frameOfInterest[interest] = frame;
        measured_[camera]->TakeIn(frame, time);
      }
      if (frame != frames_.first) continue;
      std::erase_if(cameras, [this](std::size_t camera) { return !measured_[camera]->Moves(); });
      if (cameras.empty()) return;
    }
  }

  const Subject& subject_;
  diag::Collector unreported_;
  diag::Collector evaluated_;
  motion::Evaluator evaluator_;
  motion::Evaluator interests_;
  double unitsPerFrame_;
  std::deque<CameraShift> cameras_;
  motion::FrameEnds frames_;
  std::vector<CameraShift*> measured_;
  std::vector<std::uint32_t> partOfInterest_;  // by camera that is measured
};

}  // namespace

std::map<scene::NodeId, LargestShift> ReportShifts(const Subject& subject) {
  if (!subject.cameOver.composition) return {};
  return Shifts(subject).Report();
}

}  // namespace check
