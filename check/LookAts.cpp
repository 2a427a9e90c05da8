#include "check/LookAts.h"

#include <algorithm>

#include "check/Cameras.h"

namespace check {
namespace {

// The importer finds it anywhere in the attribute.
constexpr std::string_view kTarget = "target";

// The attribute of a plug as the file has it.
std::string_view WrittenAttribute(const scene::Scene& scene, const diag::Range& plug) {
  const std::string_view text =
      scene.text().substr(static_cast<std::size_t>(plug.offset), static_cast<std::size_t>(plug.length));
  const std::size_t dot = text.find('.');
  return dot == std::string_view::npos ? std::string_view() : text.substr(dot + 1);
}

}  // namespace

bool IsLookAt(std::string_view type) { return SameName(type, "lookAt") || SameName(type, "aimConstraint"); }

std::vector<const scene::Connection*> TargetsOf(const scene::Scene& scene, scene::NodeId lookAt) {
  std::vector<const scene::Connection*> targets = scene.ConnectionsInto(lookAt);
  std::erase_if(targets, [&scene](const scene::Connection* connection) {
    return WrittenAttribute(scene, connection->destinationPlace).find(kTarget) == std::string_view::npos;
  });
  std::stable_sort(targets.begin(), targets.end(), [](const auto* one, const auto* other) {
    return one->destinationPlace.offset < other->destinationPlace.offset;
  });
  return targets;
}

}  // namespace check
