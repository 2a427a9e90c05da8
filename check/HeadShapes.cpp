// What a camera and a locator have in common in the head: what stands above them, what drives that, and the
// layer.
#include "check/HeadInternal.h"
#include "scene/Attributes.h"

namespace check {
namespace {

// A chain can be as long as its file, and each of its shapes says its path.
constexpr std::size_t kLongestPath = 1000;

// The bytes of a name that are kept: names can be as long as the file, too, and stand above many shapes.
constexpr std::size_t kLongestName = 200;

std::size_t KeysOf(const scene::Scene& scene, scene::NodeId curve) {
  std::size_t keys = 0;
  for (const scene::Piece& piece : scene.Pieces(curve, "keyTimeValue")) {
    keys += static_cast<std::size_t>(piece.last - piece.first) + 1;
  }
  return keys;
}

void DescribeChain(const HeadSource& source, scene::NodeId transform, ShapeHead* head) {
  const scene::Scene& scene = source.scene;
  for (scene::NodeId id = transform; id != scene::kNoNode; id = scene.node(id).parent) {
    // A longer chain ends here, so that reports do not grow faster than their scenes.
    if (head->chain.size() == Head::kMostLinks) {
      head->chainGoesOn = true;
      return;
    }
    ChainLink& link = head->chain.emplace_back();
    link.name = ShownName(scene.node(id).name);
    for (const std::string_view channel : scene::kPlaceChannels) AddDrive(source, id, channel, &link.drives);
  }
}

void DescribeLayer(const CameOver& cameOver, const CameOverLayer& layer, ShapeHead* head) {
  head->cameOver = true;
  head->keys = layer.position.times.size();
  for (auto above = layer.parent; above && head->parents < cameOver.layers.size();
       above = cameOver.layers[*above].parent) {
    if (++head->parents == Head::kMostLinks) break;
  }
}

}  // namespace

std::string ShownName(std::string_view name) {
  if (name.size() <= kLongestName) return std::string(name);
  return std::string(name.substr(0, kLongestName)) + "...";
}

void AddDrive(const HeadSource& source, scene::NodeId node, std::string_view attribute,
              std::vector<Drive>* drives) {
  const scene::Scene& scene = source.scene;
  const std::optional<scene::Driver> driver = scene.SourceOf(scene.PlugOf(node, attribute));
  if (!driver) return;
  const scene::Node& by = scene.node(driver->plug.node);
  Drive drive{.channel = std::string(attribute),
              .node = ShownName(by.name),
              .type = ShownName(by.type),
              .keys = std::nullopt,
              .where = WhereIs(driver->connection->destinationPlace, source.lines)};
  if (by.type.starts_with("animCurve")) drive.keys = KeysOf(scene, driver->plug.node);
  drives->push_back(std::move(drive));
}

void DescribeShape(const HeadSource& source, scene::NodeId shape, const CameOverLayer* layer,
                   ShapeHead* head) {
  const scene::Node& node = source.scene.node(shape);
  head->path = source.scene.PathOf(shape, kLongestPath);
  head->where = WhereIs(node.place, source.lines);
  DescribeChain(source, node.parent, head);
  if (layer != nullptr) DescribeLayer(source.cameOver, *layer, head);
}

}  // namespace check
