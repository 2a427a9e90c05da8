// The picture of one camera: the scene's against that of the import.
#pragma once

#include <optional>
#include <vector>

#include "check/ImportedPicture.h"
#include "check/RulesInternal.h"
#include "motion/Camera.h"
#include "motion/Evaluator.h"
#include "motion/KeptBelow.h"
#include "motion/SceneCamera.h"

namespace check {

// Nine points of the picture, followed over the frames. What it is given must outlive it.
class CameraShift {
 public:
  // `interests` gives the distance of the centre of interest alone: nothing is reported of what drives that.
  CameraShift(const Subject& subject, const Camera& camera, motion::Evaluator* evaluator,
              motion::Evaluator* interests);

  const Camera& camera() const { return camera_; }

  // Whether its place, its lens or its layers can change from frame to frame.
  bool Moves() const;

  // How many layers the import's picture depends on.
  std::size_t layers() const { return imported_.layers(); }

  // What the evaluators are asked for.
  motion::Evaluator::Wanted Wanted() const { return {lens_.Numbers(), {world_}}; }
  motion::Evaluator::Wanted WantedOfInterest() const { return {{interest_}, {}}; }

  // Both evaluators stand at the frame. `time` is the frame in the scene's unit of time.
  void TakeIn(double frame, double time);

  // The channels below the picture of the scene that keep a stored value, although something drives them.
  std::vector<motion::Kept> Unknown(const motion::KeptBelow& kept) const {
    return kept.Of(lens_.Numbers(), {world_});
  }

  // The largest shift of the frames that were taken in; none where no frame gives one.
  std::optional<LargestShift> Report() const;

 private:
  void Compare(double u, double v, const motion::Vector& point, double frame);

  const Subject& subject_;
  const Camera& camera_;
  motion::Evaluator& evaluator_;
  motion::Evaluator& interests_;
  motion::SceneCamera lens_;
  motion::MatrixId world_;
  motion::NumberId interest_;
  motion::Picture picture_;
  ImportedPicture imported_;
  double start_;  // the time of the scene that is time 0 of the composition
  bool seen_ = false;
  bool changed_ = false;  // at some frame, by what no layer has
  LargestShift largest_;
};

}  // namespace check
