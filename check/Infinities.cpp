// Curves that go on outside their keys, where the import holds the first or the last one.
#include <array>
#include <string>
#include <string_view>

#include "check/RulesInternal.h"

namespace check {
namespace {

using diag::Code;

// By the number that a scene writes.
constexpr std::array<std::string_view, 6> kWords = {"constant",          "linear",   "", "cycle",
                                                    "cycle with offset", "oscillate"};

std::string_view WordOf(int code) {
  const auto index = static_cast<std::size_t>(code);  // of a negative one, beyond the words
  return index < kWords.size() ? kWords[index] : std::string_view();
}

class Infinities {
 public:
  Infinities(const Subject& subject, const motion::FrameEnds& frames) : subject_(subject), frames_(frames) {}

  void Report(scene::NodeId node, std::span<const KeyedChannel> channels) const {
    ReportSide(node, channels, CurveEnd::Before);
    ReportSide(node, channels, CurveEnd::After);
  }

 private:
  void ReportSide(scene::NodeId node, std::span<const KeyedChannel> channels, CurveEnd side) const {
    const std::string_view attribute = side == CurveEnd::Before ? "preInfinity" : "postInfinity";
    std::string names;
    std::string_view word;
    diag::Range place;
    for (const KeyedChannel& channel : channels) {
      const auto written = subject_.scene.Written(channel.curve, attribute);
      if (!written) continue;
      if (!subject_.shapes.GoesOn(channel.curve, side, frames_)) continue;
      if (names.empty()) {
        place = written->range();
        word = WordOf(subject_.shapes.InfinityOf(channel.curve, side));
      }
      names += (names.empty() ? "" : ", ") + std::string(channel.channel);
    }
    if (names.empty()) return;
    subject_.diagnostics.Report(
        Code::InfinityLost, place,
        {subject_.scene.node(node).name, names, side == CurveEnd::Before ? "before" : "after", word});
  }

  const Subject& subject_;
  const motion::FrameEnds& frames_;
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
