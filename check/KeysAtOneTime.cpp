// Keys that land on one time of the composition: one of them is lost.
#include <algorithm>
#include <cmath>
#include <span>
#include <string>
#include <utility>
#include <vector>

#include "check/Curves.h"
#include "check/RulesInternal.h"
#include "check/Times.h"
#include "scene/Cursor.h"

namespace check {
namespace {

using scene::NodeId;

// A time of the composition is a whole number of thousandths, in 31 bits.
constexpr double kParts = 1000.0;
constexpr double kLastTime = 2147483647.0;

struct Key {
  double landed = 0.0;  // on this time of the composition
  std::size_t number = 0;
};

// As it is written, and where.
struct WrittenTime {
  std::string_view text;
  diag::Range place;
};

// The times of the keys with these numbers, which rise.
std::vector<WrittenTime> FindTimes(const scene::Scene& scene, NodeId curve,
                                   std::span<const std::size_t> keys) {
  std::vector<WrittenTime> times;
  std::size_t count = 0;
  for (const scene::Piece& piece : scene.Pieces(curve, "keyTimeValue")) {
    const auto [offset, length] = piece.value.range();
    scene::Cursor cursor(scene.text().substr(0, static_cast<std::size_t>(offset + length)));
    cursor.MoveTo(static_cast<std::uint32_t>(offset));
    for (std::size_t word = 0; times.size() < keys.size(); ++word) {
      std::uint32_t openComment = scene::Cursor::kNone;
      cursor.SkipBlank(&openComment);
      const std::uint64_t begin = cursor.offset();
      const std::string_view text = cursor.TakeWord();
      if (text.empty()) break;
      if (word % 2 != 0) continue;
      if (count++ == keys[times.size()]) times.push_back({text, {begin, text.size()}});
    }
  }
  return times;
}

// Where the keys of the curve land, in the order of their times. `first` is what the node's time begins with.
std::vector<Key> KeysInTime(const Subject& subject, const KeyedChannel& channel, double first) {
  const double offset = CountsFrames(subject.scene) ? first : 0.0;
  std::vector<Key> keys;
  for (const scene::Piece& piece : subject.scene.Pieces(channel.curve, "keyTimeValue")) {
    const std::vector<double> numbers = piece.value.Numbers();
    for (std::size_t i = 0; i < numbers.size(); i += 2) {
      const double time = keys.empty() ? first : numbers[i];
      keys.push_back({std::trunc((time - offset) * kParts + 0.5), keys.size()});
    }
  }
  std::stable_sort(keys.begin(), keys.end(), [](const Key& a, const Key& b) { return a.landed < b.landed; });
  return keys;
}

// Two keys of a curve, by their numbers.
using Pair = std::pair<std::size_t, std::size_t>;

void ReportPairs(const Subject& subject, NodeId node, const KeyedChannel& channel,
                 const std::vector<Pair>& pairs) {
  std::vector<std::size_t> numbers;
  for (const auto& [one, other] : pairs) numbers.insert(numbers.end(), {one, other});
  std::sort(numbers.begin(), numbers.end());
  numbers.erase(std::unique(numbers.begin(), numbers.end()), numbers.end());
  const std::vector<WrittenTime> times = FindTimes(subject.scene, channel.curve, numbers);
  if (times.size() != numbers.size()) return;
  const auto timeOf = [&](std::size_t number) {
    return times[static_cast<std::size_t>(std::lower_bound(numbers.begin(), numbers.end(), number) -
                                          numbers.begin())];
  };
  const auto line = [&](const WrittenTime& time) {
    return std::to_string(subject.diagnostics.lines().At(time.place.offset).line);
  };
  for (const auto& [one, other] : pairs) {
    const WrittenTime earlier = timeOf(one);
    const WrittenTime later = timeOf(other);
    subject.diagnostics.Report(diag::Code::KeysAtOneTime, later.place,
                               {subject.scene.node(node).name, subject.scene.node(channel.curve).name,
                                earlier.text, line(earlier), later.text, line(later)});
  }
}

// All keys of a node have the times of its first channel with `fewest` keys or more. Its time begins with the
// first key of the first channel with any.
void ReportNode(const Subject& subject, NodeId node, std::span<const KeyedChannel> channels,
                std::size_t fewest) {
  const auto with = [&](std::size_t keys) {
    return std::find_if(channels.begin(), channels.end(),
                        [keys](const KeyedChannel& channel) { return channel.keys >= keys; });
  };
  const auto lead = with(fewest);
  if (lead == channels.end()) return;
  const double first = with(1)->first;
  if (!lead->crowded && first == lead->first) return;
  const std::vector<Key> keys = KeysInTime(subject, *lead, first);
  std::vector<Pair> pairs;
  for (std::size_t i = 1; i < keys.size(); ++i) {
    if (keys[i].landed == keys[i - 1].landed && std::fabs(keys[i].landed) < kLastTime)
      pairs.emplace_back(keys[i - 1].number, keys[i].number);
  }
  ReportPairs(subject, node, *lead, pairs);
}

}  // namespace

void ReportKeysAtOneTime(const Subject& subject) {
  for (const Link& link : subject.links)
    ReportNode(subject, link.node, subject.channels.KeyedOf(link.node), 2);
  for (const Camera& camera : subject.cameras) {
    if (camera.taken) ReportNode(subject, camera.shape, subject.channels.LensOf(camera.shape), 1);
  }
}

}  // namespace check
