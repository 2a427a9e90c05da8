// Channels whose motion does not come over.
#include <cmath>
#include <map>
#include <set>
#include <string>
#include <utility>
#include <vector>

#include "check/Curves.h"
#include "check/LookAts.h"
#include "check/RulesInternal.h"
#include "scene/Attributes.h"

namespace check {
namespace {

using diag::Code;
using scene::NodeId;

std::string_view WrittenAt(const scene::Scene& scene, const diag::Range& range) {
  return scene.text().substr(static_cast<std::size_t>(range.offset), static_cast<std::size_t>(range.length));
}

// Whether the node has a place in the scene: what it computes then comes from more than its curves.
bool IsPlaced(const scene::Scene& scene, NodeId node) {
  const scene::Node& one = scene.node(node);
  return one.parent != scene::kNoNode || one.firstChild != scene::kNoNode || one.type == "transform";
}

// Whether a curve drives the node: itself, or through nodes that have no place of their own.
bool ComesFromCurve(const scene::Scene& scene, NodeId from) {
  constexpr std::size_t kMostNodes = 64;
  if (IsPlaced(scene, from)) return false;
  std::vector<NodeId> pending{from};
  std::set<NodeId> seen{from};
  while (!pending.empty() && seen.size() < kMostNodes) {
    const NodeId node = pending.back();
    pending.pop_back();
    for (const scene::Connection* const connection : scene.ConnectionsInto(node)) {
      const NodeId source = connection->source.node;
      if (IsImportedCurve(scene.node(source).type)) return true;
      if (seen.size() < kMostNodes && !IsPlaced(scene, source) && seen.insert(source).second)
        pending.push_back(source);
    }
  }
  return false;
}

struct Driven {
  std::string channels;
  diag::Range place;
};

void Add(std::string_view channel, std::string* channels) {
  if (!channels->empty()) *channels += ", ";
  *channels += channel;
}

void KeepAsSaid(const Subject& subject, const scene::Driver& driver) {
  if (subject.driversSaid != nullptr) subject.driversSaid->insert(driver.connection->destinationPlace.offset);
}

// Reports the drivers of the node that are not curves, a diagnostic for each.
void ReportDrivers(const Subject& subject, const Link& link) {
  const scene::Scene& scene = subject.scene;
  std::map<NodeId, Driven> drivers;
  for (const auto& [channel, driver] : subject.channels.DriversOf(link.node)) {
    const std::string_view type = scene.node(driver.plug.node).type;
    const diag::Range place = driver.connection->destinationPlace;
    if (IsImportedCurve(type)) {
      if (IsPath(scene, place))
        subject.diagnostics.Report(Code::ConnectionToPath, place, {WrittenAt(scene, place)});
      continue;
    }
    // Of a camera's look-at its own rule says what became of it.
    if (link.own && link.ofCamera && IsLookAt(type) && channel.starts_with("rotate")) continue;
    if (link.target && !channel.starts_with("translate")) continue;
    KeepAsSaid(subject, driver);
    Driven& driven = drivers.try_emplace(driver.plug.node, Driven{{}, place}).first->second;
    Add(channel, &driven.channels);
  }
  for (const auto& [id, driven] : drivers) {
    const scene::Node& driver = scene.node(id);
    const Code code = ComesFromCurve(scene, id) ? Code::CurveThroughNode : Code::DrivenByNoCurve;
    subject.diagnostics.Report(code, driven.place,
                               {scene.node(link.node).name, driven.channels, driver.name,
                                driver.type.empty() ? "in another file" : driver.type});
  }
}

// A node whose curves have one key each is not animated for the importer, and keeps its stored values.
void ReportOneKey(const Subject& subject, const Link& link) {
  std::string channels;
  diag::Range place;
  for (const KeyedChannel& keyed : KeyedOf(subject, link)) {
    if (keyed.keys > 1) return;
    const double stored = subject.scene.Number(link.node, keyed.channel).value_or(0.0);
    if (keyed.keys == 0 || std::fabs(stored - keyed.firstValue) <= 1e-9 * (1.0 + std::fabs(stored))) continue;
    if (channels.empty()) place = keyed.place;
    Add(keyed.channel, &channels);
  }
  if (channels.empty()) return;
  subject.diagnostics.Report(Code::ChannelsOfOneKey, place, {subject.scene.node(link.node).name, channels});
}

void ReportFocalLength(const Subject& subject, NodeId camera) {
  const scene::Scene& scene = subject.scene;
  const auto driver = scene.SourceOf(scene.PlugOf(camera, "focalLength"));
  if (!driver) return;
  const scene::Node& source = scene.node(driver->plug.node);
  const diag::Range place = driver->connection->destinationPlace;
  if (!IsImportedCurve(source.type)) {
    KeepAsSaid(subject, *driver);
    subject.diagnostics.Report(
        Code::FocalLengthElsewhere, place,
        {scene.node(camera).name, source.name, source.type.empty() ? "in another file" : source.type});
  } else if (IsPath(scene, place)) {
    subject.diagnostics.Report(Code::ConnectionToPath, place, {WrittenAt(scene, place)});
  }
}

}  // namespace

void ReportLostChannels(const Subject& subject) {
  for (const Link& link : subject.links) {
    ReportDrivers(subject, link);
    ReportOneKey(subject, link);
  }
  for (const Camera& camera : subject.cameras) {
    if (camera.taken) ReportFocalLength(subject, camera.shape);
  }
}

}  // namespace check
