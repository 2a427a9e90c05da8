#include "check/Difference.h"

#include <algorithm>
#include <cmath>
#include <vector>

#include "motion/CurveReader.h"
#include "text/Numbers.h"

namespace check {
namespace {

// Rounding errors are smaller: of lengths, and of any other number.
constexpr double kSameLength = 1e-6;
constexpr double kSameNumber = 1e-9;

}  // namespace

std::optional<Difference> DifferenceFrom(const Subject& subject, scene::NodeId node,
                                         std::string_view attribute, double neutral) {
  const scene::Scene& scene = subject.scene;
  const scene::Plug plug = scene.PlugOf(node, attribute);
  const double same = motion::KindOf(scene, plug) == motion::Kind::kLength
                          ? kSameLength
                          : kSameNumber * std::max(1.0, std::fabs(neutral));
  const auto differs = [=](double number) { return !(std::fabs(number - neutral) <= same); };
  if (const auto driver = scene.SourceOf(plug)) {
    const diag::Range place = driver->connection->destinationPlace;
    const scene::Node& source = scene.node(driver->plug.node);
    if (!source.type.starts_with("animCurveT")) {
      return Difference{place, '"' + std::string(source.name.substr(0, 100)) + "\" drives it"};
    }
    const std::vector<motion::CurveKey> keys =
        motion::ReadCurve(scene, driver->plug.node, subject.measures).keys;
    const auto key = std::find_if(keys.begin(), keys.end(),
                                  [&](const motion::CurveKey& one) { return differs(one.value); });
    if (key == keys.end()) return std::nullopt;
    return Difference{place, "it has keys, one at " + text::RoundedNumber(key->value)};
  }
  const auto written = scene.Written(node, attribute);
  const auto number = written ? written->Number() : std::nullopt;
  if (!number || !differs(*number)) return std::nullopt;
  return Difference{written->range(), "it is " + text::RoundedNumber(*number)};
}

}  // namespace check
