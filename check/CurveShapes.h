// What the rules need to know of curves, each read once however many nodes it drives.
#pragma once

#include <array>
#include <optional>
#include <unordered_map>

#include "motion/Curve.h"
#include "motion/FrameEnds.h"
#include "motion/Measures.h"
#include "scene/Scene.h"

namespace check {

enum class CurveEnd { Before, After };

// What it is given must outlive it.
class CurveShapes {
 public:
  CurveShapes(const scene::Scene& scene, const motion::Measures& measures)
      : scene_(scene), measures_(measures) {}

  // Whether a straight way from key to key leaves the curve at some frame.
  bool IsCurved(scene::NodeId curve);

  // Whether it turns by half a turn or more from one key to the next, with a frame between them. Values are
  // angles.
  bool TurnsFar(scene::NodeId curve);

  // Whether the curve leaves its outermost key at one of the frames outside its keys. The frames are the same
  // in all calls.
  bool GoesOn(scene::NodeId curve, CurveEnd end, const motion::FrameEnds& frames);

  // The code of what it does there, as the scene has it.
  int InfinityOf(scene::NodeId curve, CurveEnd end);

 private:
  struct Known {
    explicit Known(motion::Curve read) : curve(std::move(read)) {}

    motion::Curve curve;
    std::optional<bool> curved, turnsFar;
    std::array<std::optional<bool>, 2> goesOn;  // by CurveEnd
  };

  Known& Of(scene::NodeId curve);
  double FramesPerSecond() const;

  const scene::Scene& scene_;
  const motion::Measures& measures_;
  std::unordered_map<scene::NodeId, Known> known_;
};

}  // namespace check
