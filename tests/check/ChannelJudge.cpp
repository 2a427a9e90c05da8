#include "tests/check/ChannelJudge.h"

#include <algorithm>

namespace check_test {
namespace {

using check::CameOverLayer;
using check::LayerKind;
using diag::Code;

bool IsMarked(std::string_view name) {
  return name.find("null") != std::string_view::npos || name.find("Null") != std::string_view::npos ||
         name.find("NULL") != std::string_view::npos;
}

// The importer takes names as they are written.
std::string Unescaped(std::string_view written) {
  std::string name;
  for (std::size_t i = 0; i < written.size(); ++i) {
    if (written[i] == '\\' && i + 1 < written.size()) ++i;
    name += written[i];
  }
  return name;
}

std::size_t KeysOf(const CameOverLayer& layer) { return layer.position.times.size(); }

}  // namespace

ChannelJudge::ChannelJudge(const PlainScene& scene, const check::CameOver& cameOver,
                           const check::Report& report, Compared* compared)
    : scene_(scene),
      cameOver_(cameOver),
      report_(report),
      compared_(*compared),
      taken_(cameOver.layers.size(), false),
      others_(StartOfCameras()) {}

bool ChannelJudge::IsCamera(const PlainNode& node) {
  return node.type == "camera" || node.type == "stereoRigCamera";
}

std::string ChannelJudge::Run() {
  for (const auto judge : {&ChannelJudge::JudgeCameras, &ChannelJudge::JudgeLocators}) {
    const std::string wrong = (this->*judge)();
    if (!wrong.empty()) return wrong;
  }
  const bool scaled = !cameOver_.layers.empty() && !scene_.countsCentimeters();
  if (scaled != SaysAnywhere({Code::OtherLengthUnit})) return "of the unit of length the wrong is said";
  return JudgeLeftOver();
}

// The import makes the layers of its cameras in the order of the file, each with its nulls.
const CameOverLayer* ChannelJudge::TakeNext(LayerKind kind, std::string_view name) {
  for (std::size_t i = 0; i < taken_.size(); ++i) {
    if (taken_[i] || cameOver_.layers[i].kind != kind) continue;
    if (cameOver_.layers[i].name != name) return nullptr;
    taken_[i] = true;
    return &cameOver_.layers[i];
  }
  return nullptr;
}

std::string ChannelJudge::JudgeCameras() {
  std::size_t number = 0;
  for (int id = 0; id < static_cast<int>(scene_.nodes().size()); ++id) {
    const PlainNode& node = scene_.node(id);
    if (!IsCamera(node)) continue;
    const CameOverLayer* const layer = TakeNext(LayerKind::Camera, node.name);
    if (node.startup && layer == nullptr) {
      if (!SaysAnywhere({Code::StartupCameras})) return "nothing is said of " + node.name;
      continue;
    }
    const bool shown = number < report_.head.cameras.size();
    const check::CameraHead* const head = shown ? &report_.head.cameras[number] : nullptr;
    ++number;
    if (head == nullptr && report_.head.camerasNotShown == 0) return "the head lacks " + node.name;
    if (head != nullptr && !head->path.ends_with('|' + Unescaped(node.name)))
      return "the head has " + head->path + " where " + node.name + " is meant";
    if (head != nullptr && head->cameOver != (layer != nullptr))
      return "the head contradicts that " + node.name +
             (layer != nullptr ? " came over" : " did not come over");
    if (layer == nullptr) {
      if (!Says({Code::OrthographicCamera, Code::CameraNotImported}, id) && !IsAmbiguous(id))
        return node.name + " did not come over, and nothing is said of it";
      continue;
    }
    const std::string wrong = JudgeCamera(id, *layer, head);
    if (!wrong.empty()) return wrong;
  }
  return "";
}

std::string ChannelJudge::JudgeCamera(int shape, const CameOverLayer& layer, const check::CameraHead* head) {
  const int transform = scene_.node(shape).parent;
  const Start start = StartOf(shape);
  const auto place = static_cast<std::size_t>(&layer - cameOver_.layers.data());
  std::string wrong = head != nullptr ? JudgeHead(*head, layer, shape) : "";
  if (wrong.empty()) wrong = JudgeZoom(shape, layer, start);
  if (wrong.empty()) wrong = JudgeShapeAndChain(shape, place, layer.aimed);
  if (wrong.empty() && transform != kNone) wrong = JudgeInterest(transform, shape, layer);
  return wrong;
}

std::string ChannelJudge::JudgeHead(const check::CameraHead& head, const CameOverLayer& layer,
                                    int shape) const {
  std::size_t parents = 0;
  for (auto above = layer.parent; above && parents < check::Head::kMostLinks;
       above = cameOver_.layers[*above].parent)
    ++parents;
  const std::string& name = scene_.node(shape).name;
  if (head.keys != KeysOf(layer)) return "the head has other keys than the layer of " + name;
  if (head.zoomKeys != layer.zoom.times.size()) return "the head has other zoom keys than " + name;
  if (head.parents != parents) return "the head has other parents than " + name;
  return "";
}

// The shape's own transform is the layer; each transform above it is the null that is the parent of the one
// before.
std::string ChannelJudge::JudgeShapeAndChain(int shape, std::size_t layer, bool aimed) {
  const bool ofCamera = IsCamera(scene_.node(shape));
  int below = shape;
  for (bool own = true;; own = false) {
    ++compared_.layers;
    const PlainNode& child = scene_.node(below);
    const CameOverLayer& one = cameOver_.layers[layer];
    if (IsAmbiguous(below) || (child.parent != kNone && IsAmbiguous(child.parent))) {
      ++compared_.ambiguous;
      for (auto above = one.parent; above; above = cameOver_.layers[*above].parent) taken_[*above] = true;
      return "";
    }
    if (child.parentWritten.empty() || (!own && Says({Code::InheritanceOff}, below) && child.parent == kNone))
      return one.parent && !own ? child.name + " has a layer above it, and no parent" : "";
    const bool lost = Says({Code::ParentIsPath, Code::ParentNotImported, Code::ParentElsewhere}, below);
    if (child.parent == kNone && !lost)
      return "nothing is said of the parent of " + child.name + ", which the file does not create";
    if (own) {
      if (lost) return one.parent ? child.name + " lost its place, and has a layer above it" : "";
    } else {
      if (!one.parent) return lost ? "" : "the layer of " + child.name + " has no parent";
      const CameOverLayer& parent = cameOver_.layers[*one.parent];
      const std::string& wanted = lost ? child.parentWritten : scene_.node(child.parent).name;
      if (parent.kind != LayerKind::Null || parent.name != wanted)
        return "the layer above " + child.name + " is " + parent.name + ", not " + wanted;
      layer = *one.parent;
      taken_[layer] = true;
      if (lost) return "";
      if (scene_.Number(below, "it", 1.0) == 0.0 && !Says({Code::InheritanceOff}, below))
        return child.name + " does not inherit, and nothing is said of it";
    }
    below = child.parent;
    const Start start = ofCamera ? StartOf(shape) : StartOfOthers(FirstKeyOf(below));
    std::string wrong = JudgeMotion(below, shape, own && aimed, cameOver_.layers[layer], start);
    if (!wrong.empty()) return wrong;
  }
}

std::string ChannelJudge::JudgeLocators() {
  std::size_t unmarked = 0;
  for (int id = 0; id < static_cast<int>(scene_.nodes().size()); ++id) {
    const PlainNode& node = scene_.node(id);
    if (node.type != "locator") continue;
    if (!IsMarked(node.name)) {
      ++unmarked;
      continue;
    }
    const CameOverLayer* const layer = TakeNext(LayerKind::Null, node.name);
    if (layer == nullptr) {
      if (cameOver_.layers.empty() && SaysAnywhere({Code::LocatorsWithoutCamera})) continue;
      if (!IsAmbiguous(id)) return "the locator " + node.name + " did not come over";
      continue;
    }
    const auto place = static_cast<std::size_t>(layer - cameOver_.layers.data());
    const std::string wrong = JudgeShapeAndChain(id, place, false);
    if (!wrong.empty()) return wrong;
  }
  const bool said = SaysWith({Code::LocatorsLeftOut}, {std::to_string(unmarked)});
  if (said != (unmarked != 0)) return std::to_string(unmarked) + " locators are not marked";
  return "";
}

std::string ChannelJudge::JudgeLeftOver() const {
  for (std::size_t i = 0; i < taken_.size(); ++i) {
    if (!taken_[i]) return "nothing in the scene explains the layer " + cameOver_.layers[i].name;
  }
  return "";
}

}  // namespace check_test
