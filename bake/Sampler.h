// Evaluates the written channels, frame by frame.
#pragma once

#include <array>
#include <cstddef>
#include <optional>
#include <string_view>
#include <vector>

#include "bake/FrameRange.h"
#include "bake/Track.h"
#include "diag/Collector.h"
#include "motion/Camera.h"
#include "motion/Evaluator.h"
#include "motion/KeptBelow.h"
#include "motion/SceneCamera.h"
#include "scene/Scene.h"

namespace bake {

// Ask for tracks, run once, then take the tracks by the numbers that were given for them.
class Sampler {
 public:
  // The evaluator must outlive the sampler. `unitsPerFrame` is one frame in the scene's time unit.
  Sampler(motion::Evaluator* evaluator, const motion::Picture& picture, double unitsPerFrame)
      : evaluator_(evaluator), picture_(picture), unitsPerFrame_(unitsPerFrame) {}

  // The node in its parent's space: exactly its own channels where IsPlain.
  std::size_t AddLocal(scene::NodeId node);

  // The node in world space. Without `scaled`, as for a camera, the scale is 1 and the direction is kept.
  std::size_t AddWorld(scene::NodeId node, bool scaled);

  std::size_t AddLens(scene::NodeId camera);

  // Samples all frames; what does not move is sampled once.
  void Run(const FrameRange& frames);

  // The channels below a track or a lens that keep their stored values.
  std::vector<motion::Kept> KeptOfTrack(std::size_t number, const motion::KeptBelow& below) const;
  std::vector<motion::Kept> KeptOfLens(std::size_t number, const motion::KeptBelow& below) const;

  Track& track(std::size_t number) { return tracks_[number]; }
  LensTrack& lens(std::size_t number) { return lenses_[number]; }

 private:
  // Where a track's values come from: nine numbers, or a matrix.
  struct Source {
    std::array<motion::NumberId, kSlotCount> numbers{};
    std::optional<motion::MatrixId> matrix;
    bool scaled = true;
    bool turned = false;    // by a constraint
    motion::Vector angles;  // of the frame before, in radians
  };
  struct LensSource {
    motion::SceneCamera camera;
    double window = 0.0;  // of the first frame, along the side that fills the picture: inches
  };

  // The sets of values for Evaluator::Split: one for each track, then one for each lens.
  std::vector<motion::Evaluator::Wanted> Wanted() const;
  // The tracks and the lenses of one part of what moves.
  struct Part {
    std::vector<std::size_t> tracks;
    std::vector<std::size_t> lenses;
  };
  void MakeRoom(const Part& part, std::size_t frames);
  void SampleFrame(const Part& part, bool first);
  void Finish();
  void SampleNumbers(const Source& source, bool first, Track* track);
  void SampleMatrix(Source* source, Track* track);
  void SampleLens(LensSource* source, LensTrack* lens);

  motion::Evaluator* evaluator_;
  motion::Picture picture_;
  double unitsPerFrame_;
  std::vector<Source> sources_;
  std::vector<Track> tracks_;
  std::vector<LensSource> lensSources_;
  std::vector<LensTrack> lenses_;
};

}  // namespace bake
