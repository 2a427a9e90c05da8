#include "tests/check/LayerContradictions.h"

#include <initializer_list>
#include <string>
#include <vector>

#include "scene/SpecialNames.h"
#include "tests/check/Author.h"
#include "tests/check/ValueContradictions.h"

namespace check_test {
namespace {

using check::CameOverLayer;
using check::LayerKind;
using diag::Code;
using scene::kNoNode;
using scene::NodeId;

class Walk {
 public:
  Walk(const Author& author, const check::CameOver& cameOver, const check::Report& report, Compared* compared)
      : author_(author), cameOver_(cameOver), report_(report), compared_(compared) {}

  std::string Run() {
    Heads();
    if (wrong_.empty() && next_ != cameOver_.layers.size())
      Say(kNoNode, "no node of the scene has the layer " + cameOver_.layers[next_].name);
    return wrong_;
  }

 private:
  bool IsOfType(NodeId id, std::initializer_list<std::string_view> types) const {
    for (const std::string_view type : types) {
      if (SameWithoutCase(author_.scene.node(id).type, type)) return true;
    }
    return false;
  }

  void Say(NodeId node, const std::string& what) {
    if (wrong_.empty()) wrong_ = (node == kNoNode ? "" : author_.scene.PathOf(node) + ": ") + what;
  }

  bool IsSaid(const std::vector<NodeId>& nodes, std::initializer_list<Code> codes) const {
    return IsSaidOf(author_, report_, nodes, codes);
  }

  bool NameIsSaid(NodeId node) const {
    return IsSaid({node}, {Code::SameNames, Code::NamesDifferInCase, Code::NameTooLong, Code::NodeWithoutName,
                           Code::NameTaken});
  }

  // The import makes the cameras first, then the locators, each in the order of the file and followed by the
  // nulls of what stands above it.
  void Heads() {
    const auto& nodes = author_.scene.nodes();
    for (const bool cameras : {true, false}) {
      for (NodeId id = 0; id < nodes.size() && wrong_.empty(); ++id) {
        if (nodes[id].origin != scene::Origin::Created) continue;
        if (cameras ? IsOfType(id, {"camera", "stereoRigCamera"}) : IsOfType(id, {"locator"}))
          Head(id, cameras);
      }
    }
  }

  void Head(NodeId shape, bool camera) {
    const CameOverLayer* const layer = next_ < cameOver_.layers.size() ? &cameOver_.layers[next_] : nullptr;
    const bool came = layer != nullptr && (layer->kind == LayerKind::Camera) == camera &&
                      layer->name == author_.WrittenName(shape);
    if (!came) return CheckLoss(shape, camera);
    if (camera && IsSaid({shape}, {Code::OrthographicCamera, Code::CameraNotImported}))
      return Say(shape, "came over, and the report says that it does not");
    ++next_;
    ++compared_->layers;
    Chain(shape, *layer);
    if (camera) CheckAim(shape, *layer);
  }

  void CheckLoss(NodeId shape, bool camera) {
    if (!camera) {
      const bool said = NameIsSaid(shape) ||
                        (!scene::IsMarked(author_.WrittenName(shape)) && HasOne(Code::LocatorsLeftOut));
      if (!said) Say(shape, "the locator did not come over, and nothing is said");
      return;
    }
    const bool startup = scene::IsStartupCamera(author_.scene.node(shape)) && HasOne(Code::StartupCameras);
    if (!startup && !IsSaid({shape}, {Code::OrthographicCamera, Code::CameraNotImported}))
      Say(shape, "the camera did not come over, and nothing is said");
  }

  bool HasOne(Code code) const {
    for (const check::Finding& finding : report_.findings) {
      if (finding.diagnostic.code == code) return true;
    }
    return false;
  }

  // The layer of the shape has the place of the transform above it; its parents are what stands above that.
  void Chain(NodeId shape, const CameOverLayer& head) {
    std::vector<NodeId> places;
    NodeId below = shape;
    NodeId node = author_.scene.node(shape).parent;
    const CameOverLayer* layer = &head;
    while (wrong_.empty()) {
      const bool lost =
          IsSaid({below}, {Code::ParentIsPath, Code::ParentNotImported, Code::ParentMissing,
                           Code::ParentInReference, Code::ParentElsewhere, Code::ParentCircle}) ||
          (node != kNoNode && NameIsSaid(node)) || NameIsSaid(below);
      if (node == kNoNode || author_.scene.node(node).origin != scene::Origin::Created) {
        if (node != kNoNode && !lost) Say(below, "nothing is said of its parent");
        break;
      }
      if (below != shape && !SameWithoutCase(layer->name, author_.WrittenName(node))) {
        if (!lost) Say(below, "its parent is the layer " + layer->name + ", and nothing is said");
        break;
      }
      if (lost) break;
      wrong_ = ValueContradiction(author_, report_, {shape, node, *layer}, compared_);
      places.push_back(node);
      below = node;
      node = author_.scene.node(node).parent;
      if (layer->parent.has_value() != (node != kNoNode) && wrong_.empty()) {
        const bool said =
            IsSaid({below}, {Code::ParentIsPath, Code::ParentNotImported, Code::ParentMissing,
                             Code::ParentInReference, Code::ParentElsewhere, Code::ParentCircle}) ||
            NameIsSaid(below);
        if (!said) Say(below, layer->parent ? "has a parent that it should not have" : "has no parent");
        break;
      }
      if (!layer->parent) break;
      layer = &cameOver_.layers[*layer->parent];
    }
    if (wrong_.empty()) wrong_ = StartContradiction(author_, report_, shape, places);
    // All layers of the chain are accounted for, named or not.
    for (auto above = head.parent; above; above = cameOver_.layers[*above].parent, ++next_)
      ++compared_->layers;
  }

  // Aimed at what the look-at of the author aims at, or said.
  void CheckAim(NodeId shape, const CameOverLayer& layer) {
    const NodeId transform = author_.scene.node(shape).parent;
    NodeId lookAt = kNoNode;
    if (transform != kNoNode) {
      for (const scene::Connection* const connection : author_.scene.ConnectionsInto(transform)) {
        const bool turns = connection->destination.attribute.starts_with("rotate");
        if (turns && IsOfType(connection->source.node, {"aimConstraint", "lookAt"}))
          lookAt = connection->source.node;
      }
    }
    ++compared_->channels;
    const bool lost = IsSaid({shape, transform, lookAt},
                             {Code::LookAtShortNames, Code::LookAtNotTaken, Code::LookAtWeightLast,
                              Code::SameNames, Code::NamesDifferInCase, Code::ConnectionToPath,
                              Code::AlreadyConnected, Code::NameTaken, Code::ParentIsPath});
    if (lost || !wrong_.empty()) return;
    if ((lookAt != kNoNode) != layer.aimed)
      return Say(shape, layer.aimed ? "is aimed, and the scene has no look-at"
                                    : "is not aimed, and nothing is said");
    if (layer.aimed) wrong_ = InterestContradiction(author_, report_, {shape, lookAt, layer}, compared_);
  }

  const Author& author_;
  const check::CameOver& cameOver_;
  const check::Report& report_;
  Compared* compared_;
  std::size_t next_ = 0;
  std::string wrong_;
};

}  // namespace

std::string LayerContradictionIn(std::string_view text, const check::CameOver& cameOver,
                                 const check::Report& report, Compared* compared) {
  return Walk(Author(text), cameOver, report, compared).Run();
}

}  // namespace check_test
