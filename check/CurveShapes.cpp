#include "check/CurveShapes.h"

#include <algorithm>
#include <cmath>
#include <numbers>
#include <utility>
#include <vector>

#include "motion/BetweenKeys.h"
#include "motion/CurveReader.h"

namespace check {
namespace {

using motion::Curve;
using motion::CurveCursor;
using motion::CurveKey;

// Between two keys a curve is a cubic: where it has one value at so many frames, it has it everywhere.
constexpr double kFramesOfSpan = 8.0;

double ToleranceAt(double value) { return 1e-6 * (1.0 + std::fabs(value)); }

// The frames outside the keys of a curve, from the one beside them outwards.
class OutsideFrames {
 public:
  OutsideFrames(const Curve& curve, CurveEnd end, const motion::FrameEnds& frames, double framesPerSecond)
      : curve_(curve), end_(end), rate_(framesPerSecond) {
    const std::vector<CurveKey>& keys = curve.Data().keys;
    if (end == CurveEnd::Before) {
      first_ = frames.first;
      last_ = std::min(frames.last, std::ceil(keys.front().time * rate_ - 1e-6) - 1.0);
    } else {
      first_ = std::max(frames.first, std::floor(keys.back().time * rate_ + 1e-6) + 1.0);
      last_ = frames.last;
    }
  }

  // Whether the curve leaves its outermost key at one of them.
  bool Leave() {
    if (!(first_ <= last_)) return false;
    const motion::CurveData& data = curve_.Data();
    const bool before = end_ == CurveEnd::Before;
    switch (before ? data.preInfinity : data.postInfinity) {
      case motion::infinity::kLinear:
        return LeavesAt(before ? first_ : last_);  // the farthest
      case motion::infinity::kCycle:
      case motion::infinity::kCycleWithOffset:
      case motion::infinity::kOscillate:
        return LeaveInOneTurn();
      default:
        return false;
    }
  }

 private:
  const CurveKey& Outermost() const {
    return end_ == CurveEnd::Before ? curve_.Data().keys.front() : curve_.Data().keys.back();
  }

  bool LeavesAt(double frame) {
    if (!(frame >= first_ && frame <= last_)) return false;
    const double value = Outermost().value;
    return std::fabs(curve_.At(frame / rate_, &cursor_) - value) > ToleranceAt(value);
  }

  // One repetition of the keys: all of its frames, or, where it is long, some between each two keys.
  bool LeaveInOneTurn() {
    const std::vector<CurveKey>& keys = curve_.Data().keys;
    const double turn = std::ceil((keys.back().time - keys.front().time) * rate_) + 1.0;
    const double count = std::min(turn, last_ - first_ + 1.0);
    const bool before = end_ == CurveEnd::Before;
    if (count <= kFramesOfSpan * static_cast<double>(keys.size())) {
      for (double i = 0.0; i < count; ++i) {
        if (LeavesAt(before ? last_ - i : first_ + i)) return true;
      }
      return false;
    }
    for (std::size_t key = 0; key + 1 < keys.size(); ++key) {
      const double length = keys[key + 1].time - keys[key].time;
      for (double part = 0.0; part < kFramesOfSpan; ++part) {
        if (LeavesAt(FrameOf(keys[key].time + length * part / kFramesOfSpan))) return true;
      }
    }
    return false;
  }

  // Where the time of the curve is shown first.
  double FrameOf(double time) const {
    const motion::CurveData& data = curve_.Data();
    const double first = data.keys.front().time;
    const double last = data.keys.back().time;
    const bool before = end_ == CurveEnd::Before;
    const bool back = (before ? data.preInfinity : data.postInfinity) == motion::infinity::kOscillate;
    const double distance = before == back ? time - first : last - time;
    return std::round((before ? first - distance : last + distance) * rate_);
  }

  const Curve& curve_;
  CurveEnd end_;
  double rate_;  // frames a second
  double first_ = 0.0;
  double last_ = 0.0;
  CurveCursor cursor_;
};

}  // namespace

CurveShapes::Known& CurveShapes::Of(scene::NodeId curve) {
  const auto known = known_.find(curve);
  if (known != known_.end()) return known->second;
  return known_.try_emplace(curve, Curve(motion::ReadCurve(scene_, curve, measures_))).first->second;
}

double CurveShapes::FramesPerSecond() const {
  return measures_.framesPerSecond / motion::UnitsPerFrame(scene_);
}

bool CurveShapes::IsCurved(scene::NodeId curve) {
  Known& known = Of(curve);
  if (!known.curved) known.curved = motion::IsCurvedAtFrames(known.curve, FramesPerSecond());
  return *known.curved;
}

bool CurveShapes::TurnsFar(scene::NodeId curve) {
  Known& known = Of(curve);
  if (!known.turnsFar) {
    const double halfTurn = std::numbers::pi / measures_.radians;
    known.turnsFar = motion::TurnsFarBetweenFrames(known.curve.Data(), halfTurn, FramesPerSecond());
  }
  return *known.turnsFar;
}

bool CurveShapes::GoesOn(scene::NodeId curve, CurveEnd end, const motion::FrameEnds& frames) {
  Known& known = Of(curve);
  std::optional<bool>& goesOn = known.goesOn[static_cast<std::size_t>(end)];
  if (!goesOn) {
    // A curve of one key has its value everywhere.
    goesOn = known.curve.Data().keys.size() > 1 &&
             OutsideFrames(known.curve, end, frames, FramesPerSecond()).Leave();
  }
  return *goesOn;
}

int CurveShapes::InfinityOf(scene::NodeId curve, CurveEnd end) {
  const motion::CurveData& data = Of(curve).curve.Data();
  return end == CurveEnd::Before ? data.preInfinity : data.postInfinity;
}

}  // namespace check
