// The camera of a scene at a frame, and the picture that the scene renders.
#pragma once

#include <array>
#include <string_view>
#include <vector>

#include "motion/Camera.h"
#include "motion/Evaluator.h"
#include "scene/Settings.h"

namespace motion {

// The values of a camera that its picture depends on, from an evaluator.
class SceneCamera {
 public:
  // The evaluator must outlive the camera. `shape` is a node of a camera's type.
  SceneCamera(Evaluator* evaluator, scene::NodeId shape);

  // The camera at the evaluator's current frame.
  Camera Now() const;

  // Whether something changes the picture at that frame that Camera does not contain: a film fit offset where
  // film and picture have different shapes, changes after the projection, and pan and zoom of the view where
  // they are rendered.
  bool HasFurtherChanges(const Picture& picture) const;

  // Whether any of the values can change from frame to frame.
  bool Moves() const;

  // The ids of the values, for KeptBelow.
  std::vector<NumberId> Numbers() const { return {numbers_.begin(), numbers_.end()}; }

 private:
  static constexpr std::size_t kNumbers = 25;

  double Value(std::size_t attribute) const { return evaluator_->Value(numbers_[attribute]); }

  Evaluator* evaluator_;
  std::array<NumberId, kNumbers> numbers_{};
};

// The picture of a scene's render settings.
Picture PictureOf(const scene::Settings& settings);

}  // namespace motion
