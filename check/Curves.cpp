#include "check/Curves.h"

#include <algorithm>
#include <array>
#include <cmath>

#include "check/Cameras.h"
#include "motion/Measures.h"

namespace check {
namespace {

constexpr std::array<std::string_view, 1> kFocalLength = {"focalLength"};

// Nearer to a whole frame no composition can say it: its times are thousandths of a frame.
constexpr double kWholeFrame = 1e-3;

// Keys that lie further apart than this cannot land on one time of the composition.
constexpr double kApart = 2.5e-3;

void TakeInTime(double time, double unitsPerFrame, KeyedChannel* channel) {
  const double frame = time / unitsPerFrame;
  if (channel->keys != 0 && !(time - channel->last > kApart)) channel->crowded = true;
  if (channel->keys == 0) channel->first = time;
  const double step = frame - channel->last / unitsPerFrame;
  if (channel->keys != 0 && std::fabs(step - 1.0) > kWholeFrame) channel->whole = false;
  if (!channel->fractional && std::fabs(frame - std::round(frame)) > kWholeFrame) {
    channel->fractional = true;
    channel->fraction = frame;
  }
  channel->last = time;
  ++channel->keys;
}

void ReadKeys(const scene::Scene& scene, double unitsPerFrame, KeyedChannel* channel) {
  for (const scene::Piece& piece : scene.Pieces(channel->curve, "keyTimeValue")) {
    const std::vector<double> numbers = piece.value.Numbers();
    if (channel->keys == 0) {
      channel->place = piece.value.range();
      channel->firstValue = numbers.size() > 1 ? numbers[1] : 0.0;
    }
    for (std::size_t i = 0; i < numbers.size(); i += 2) TakeInTime(numbers[i], unitsPerFrame, channel);
  }
}

}  // namespace

bool IsImportedCurve(std::string_view type) {
  return SameName(type, "animCurveTL") || SameName(type, "animCurveTA") || SameName(type, "animCurveTU");
}

bool IsPath(const scene::Scene& scene, const diag::Range& plug) {
  const std::string_view text =
      scene.text().substr(static_cast<std::size_t>(plug.offset), static_cast<std::size_t>(plug.length));
  return text.substr(0, text.find('.')).find_first_of("|:") == 0 ||
         text.substr(0, text.find('.')).find('|') != std::string_view::npos;
}

Channels::Channels(const scene::Scene& scene) : scene_(scene), unitsPerFrame_(motion::UnitsPerFrame(scene)) {}

const Channels::Found& Channels::Of(scene::NodeId node) {
  static const Found kNothing;
  if (!scene_.IsDriven(node)) return kNothing;
  const auto known = places_.find(node);
  return known != places_.end() ? known->second
                                : places_.emplace(node, Find(node, scene::kPlaceChannels)).first->second;
}

std::span<const KeyedChannel> Channels::LensOf(scene::NodeId camera) {
  const auto known = lenses_.find(camera);
  return (known != lenses_.end() ? known : lenses_.emplace(camera, Find(camera, kFocalLength)).first)
      ->second.keyed;
}

const KeyedChannel& Channels::KeysOf(scene::NodeId curve) {
  const auto [known, isNew] = curves_.try_emplace(curve);
  if (isNew) {
    known->second.curve = curve;
    ReadKeys(scene_, unitsPerFrame_, &known->second);
  }
  return known->second;
}

Channels::Found Channels::Find(scene::NodeId node, std::span<const std::string_view> channels) {
  const std::vector<const scene::Connection*> into = scene_.ConnectionsInto(node);
  // A channel can be driven by its own name, or by that of the whole: "rotateX" or "rotate".
  const auto isDriven = [&into](std::string_view channel) {
    return std::any_of(into.begin(), into.end(), [channel](const scene::Connection* connection) {
      return channel.starts_with(connection->destination.attribute);
    });
  };
  Found found;
  for (const std::string_view channel : channels) {
    if (!isDriven(channel)) continue;  // most are not, and this costs less than to look for a driver
    const std::optional<scene::Driver> driver = scene_.SourceOf({node, channel});
    if (!driver) continue;
    found.drivers.push_back({channel, *driver});
    if (!IsImportedCurve(scene_.node(driver->plug.node).type)) continue;
    if (IsPath(scene_, driver->connection->destinationPlace)) continue;
    found.keyed.push_back(KeysOf(driver->plug.node));
    found.keyed.back().channel = channel;
  }
  return found;
}

}  // namespace check
