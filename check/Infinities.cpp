// Curves that go on outside their keys, where the import holds the first or the last one.
#include <algorithm>
#include <array>
#include <cmath>
#include <string>
#include <string_view>

#include "check/RulesInternal.h"
#include "motion/Curve.h"
#include "motion/CurveReader.h"

namespace check {
namespace {

using diag::Code;

// More frames outside the keys of one curve are not looked at.
constexpr double kMostFrames = 100'000;

enum class Side { Before, After };

// By the number that a scene writes.
constexpr std::array<std::string_view, 6> kWords = {"constant",          "linear",   "", "cycle",
                                                    "cycle with offset", "oscillate"};

std::string_view WordOf(int code) {
  const auto index = static_cast<std::size_t>(code);  // of a negative one, beyond the words
  return index < kWords.size() ? kWords[index] : std::string_view();
}

class Infinities {
 public:
  Infinities(const Subject& subject, const motion::FrameEnds& frames)
      : subject_(subject),
        frames_(frames),
        rate_(subject.measures.framesPerSecond / motion::UnitsPerFrame(subject.scene)) {}

  void Report(scene::NodeId node, std::span<const KeyedChannel> channels) const {
    ReportSide(node, channels, Side::Before);
    ReportSide(node, channels, Side::After);
  }

 private:
  // Whether the curve leaves its outermost key at a frame outside its keys.
  bool GoesOn(const motion::Curve& curve, Side side) const {
    const auto& keys = curve.Data().keys;
    if (keys.size() < 2) return false;  // of one key no curve is made of anything else
    const motion::CurveKey& key = side == Side::Before ? keys.front() : keys.back();
    const double tolerance = 1e-6 * (1.0 + std::fabs(key.value));
    double first = frames_.first;
    double last = std::min(frames_.last, std::ceil(key.time * rate_ - 1e-6) - 1.0);
    if (side == Side::After) {
      first = std::max(frames_.first, std::floor(key.time * rate_ + 1e-6) + 1.0);
      last = frames_.last;
    }
    last = std::min(last, first + kMostFrames);
    motion::CurveCursor cursor;
    for (double frame = first; frame <= last; ++frame) {
      if (std::fabs(curve.At(frame / rate_, &cursor) - key.value) > tolerance) return true;
    }
    return false;
  }

  void ReportSide(scene::NodeId node, std::span<const KeyedChannel> channels, Side side) const {
    const std::string_view attribute = side == Side::Before ? "preInfinity" : "postInfinity";
    std::string names;
    std::string_view word;
    diag::Range place;
    for (const KeyedChannel& channel : channels) {
      const auto written = subject_.scene.Written(channel.curve, attribute);
      if (!written) continue;
      const motion::Curve curve(motion::ReadCurve(subject_.scene, channel.curve, subject_.measures));
      if (!GoesOn(curve, side)) continue;
      if (names.empty()) {
        place = written->range();
        word = WordOf(side == Side::Before ? curve.Data().preInfinity : curve.Data().postInfinity);
      }
      names += (names.empty() ? "" : ", ") + std::string(channel.channel);
    }
    if (names.empty()) return;
    subject_.diagnostics.Report(
        Code::InfinityLost, place,
        {subject_.scene.node(node).name, names, side == Side::Before ? "before" : "after", word});
  }

  const Subject& subject_;
  const motion::FrameEnds& frames_;
  double rate_;  // frames a second
};

}  // namespace

void ReportInfinities(const Subject& subject, const motion::FrameEnds& frames) {
  const Infinities rule(subject, frames);
  for (const Link& link : subject.links) rule.Report(link.node, KeyedOf(subject, link));
  for (const Camera& camera : subject.cameras) {
    if (camera.taken) rule.Report(camera.shape, subject.channels.LensOf(camera.shape));
  }
}

}  // namespace check
