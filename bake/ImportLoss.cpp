// Finds what an import did not bring, although it ended without an error.
#include <algorithm>
#include <array>
#include <cmath>
#include <numbers>
#include <string>
#include <unordered_map>
#include <utility>

#include "bake/Head.h"
#include "bake/KeyedChannel.h"
#include "bake/Loss.h"
#include "bake/PlainForm.h"
#include "bake/Selection.h"
#include "diag/Fill.h"
#include "motion/BetweenKeys.h"
#include "motion/Evaluator.h"
#include "motion/KeptBelow.h"
#include "motion/SceneCamera.h"
#include "scene/Attributes.h"
#include "scene/SpecialNames.h"
#include "text/Letters.h"
#include "text/Numbers.h"

namespace bake {
namespace {

using scene::NodeId;
using text::RoundedNumber;

constexpr double kTolerance = 1e-6;  // relative: scenes write values with limited digits

bool Differ(double a, double b) {
  return std::fabs(a - b) > kTolerance * std::fmax(1.0, std::fmax(std::fabs(a), std::fabs(b)));
}

// Searches a scene, camera by camera, until it finds something that a bake would bring.
class LossSearch {
 public:
  LossSearch(const scene::Scene& scene, const CameOver& import)
      : scene_(scene),
        import_(import),
        ignored_(scene.text()),
        head_(ReadHead(scene, &ignored_)),
        evaluator_(scene, &ignored_),
        measures_(evaluator_.measures()) {}

  std::optional<Loss> Run() {
    // For the importer, names that differ only in case are the same, and all its layers can have the last
    // one.
    std::unordered_map<std::string, std::vector<const CameOver::Camera*>> byName;
    for (auto one = import_.cameras.rbegin(); one != import_.cameras.rend(); ++one) {
      byName[text::Lowered(one->name)].push_back(&*one);
    }
    for (NodeId id = 0; id < scene_.nodes().size() && !found_; ++id) {
      if (!IsSetUp(scene_, id)) continue;
      auto& layers = byName[text::Lowered(scene::ImportName(scene_, scene_.node(id)))];
      if (layers.empty()) {
        Lose(scene_.node(id).place, "the camera {0} does not come over", {ShownNode(scene_, id)});
        continue;
      }
      LookAtCamera(id, *layers.back());
      layers.pop_back();
    }
    if (import_.layers != 0 && !found_) LookAtPicture();
    if (!found_ && import_.layers == 0) LookAtLocators();
    return found_ ? found_ : unmended_;
  }

 private:
  using Arguments = std::vector<std::string>;

  void Lose(std::optional<diag::Range> place, std::string_view sentence, const Arguments& arguments) {
    if (!found_) found_ = Loss{.sentence = diag::Fill(sentence, arguments), .place = place};
  }
  void LoseForGood(std::optional<diag::Range> place, std::string_view sentence, const Arguments& arguments) {
    if (unmended_) return;
    unmended_ = Loss{.sentence = diag::Fill(sentence, arguments), .place = place, .comesWithBake = false};
  }

  void LookAtCamera(NodeId camera, const CameOver::Camera& layer) {
    firstKey_.reset();
    std::size_t step = 0;
    for (NodeId node = scene_.node(camera).parent; node != scene::kNoNode && !found_;
         node = scene_.node(node).parent, ++step) {
      const bool own = step == 0;
      if (!own && (step > layer.above.size() || !IsNameOf(node, layer.above[step - 1].name))) {
        return Lose(scene_.node(camera).place, "what stands above the camera {0} does not come over",
                    {ShownNode(scene_, camera)});
      }
      if (scene_.node(node).origin != scene::Origin::Created) {
        return LoseForGood(scene_.node(camera).place,
                           "the camera {0} stands under {1}, which is in another file",
                           {ShownNode(scene_, camera), ShownNode(scene_, node)});
      }
      if (scene_.node(node).type == "joint") {
        return Lose(scene_.node(node).place, "the place of {0} does not come over",
                    {ShownNode(scene_, node)});
      }
      LookAtPlace(node, own ? layer.keys : layer.above[step - 1].keys, own && layer.aimed);
      LookAtForm(node);
    }
    LookAtLens(camera, layer);
  }

  // A layer above a camera has the name that its child gives for its parent.
  bool IsNameOf(NodeId node, std::string_view layer) const {
    return layer == scene_.node(node).name || layer == scene::ImportName(scene_, scene_.node(node));
  }

  // Checks the nine channels of a node; `keys` is the number of keys that came over.
  void LookAtPlace(NodeId node, std::size_t keys, bool aimed) {
    std::optional<KeyedChannel> first;
    std::vector<KeyedChannel> single;
    for (const std::string_view attribute : scene::kPlaceChannels) {
      if (found_) return;
      auto channel = FindKeys(scene_, node, attribute, measures_);
      if (!channel) {
        LookAtDriver(node, attribute, aimed && attribute.starts_with("rotate"));
      } else if (channel->curve.keys.size() == 1) {
        single.push_back(std::move(*channel));
      } else {
        LookAtKeys(node, *channel, keys, first);
        if (!first) first = std::move(channel);
      }
    }
    if (first) return KeepFirstKey(node, first->curve.keys.front().time);
    for (const KeyedChannel& one : single) LookAtSingle(node, one);
  }

  void LookAtKeys(NodeId node, const KeyedChannel& channel, std::size_t came,
                  const std::optional<KeyedChannel>& first) {
    const std::string name = ShownNode(scene_, node);
    const std::string attribute(channel.attribute);
    const diag::Range place = scene_.node(channel.node).place;
    if (came == 0) return Lose(place, "no key of {0} on {1} comes over", {name, attribute});
    if (first && !SameTimes(first->curve, channel.curve)) {
      return Lose(
          place,
          "the keys of {0} on {1} stand at other times than those on {2}, and come over at the times of {2}",
          {name, attribute, std::string(first->attribute)});
    }
    const double rate = measures_.framesPerSecond / motion::UnitsPerFrame(scene_);
    const double halfTurn = std::numbers::pi / measures_.radians;
    if (motion::IsCurvedAtFrames(motion::Curve(channel.curve), rate)) {
      Lose(place, "the path between the keys of {0} on {1} does not come over", {name, attribute});
    } else if (attribute.starts_with("rotate") &&
               motion::TurnsFarBetweenFrames(channel.curve, halfTurn, rate)) {
      Lose(place,
           "{0} turns by half a turn or more between two keys on {1}, and comes over turning the shorter way",
           {name, attribute});
    }
  }

  static bool SameTimes(const motion::CurveData& a, const motion::CurveData& b) {
    for (std::size_t key = 0; key < a.keys.size() && key < b.keys.size(); ++key) {
      if (Differ(a.keys[key].time, b.keys[key].time)) return false;
    }
    return true;
  }

  // When all channels of a node have one key at most, the import takes the stored values and no keys.
  void LookAtSingle(NodeId node, const KeyedChannel& channel) {
    const double stored = scene_.Number(node, channel.attribute).value_or(0.0);
    if (!Differ(channel.curve.keys.front().value, stored)) return;
    Lose(scene_.node(channel.node).place, "{0} has a single key on {1}, which does not come over",
         {ShownNode(scene_, node), std::string(channel.attribute)});
  }

  // Checks a channel that something other than a curve may drive.
  void LookAtDriver(NodeId node, std::string_view attribute, bool aimed) {
    const scene::Plug plug = scene_.PlugOf(node, attribute);
    const auto driver = scene_.SourceOf(plug);
    if (!driver) return;
    const scene::Node& source = scene_.node(driver->plug.node);
    const bool lookAt = source.type == "lookAt" || source.type == "aimConstraint";
    if (lookAt && aimed) return;
    const diag::Range place = driver->connection->destinationPlace;
    const Arguments who = {lookAt ? "look-at" : "node", ShownNode(scene_, driver->plug.node),
                           ShownNode(scene_, node), std::string(attribute)};
    const motion::NumberId number = evaluator_.Number(node, attribute);
    evaluator_.MoveTo(0.0);
    const double stored = scene_.Number(node, attribute).value_or(0.0);
    if (evaluator_.Moves(number) || Differ(evaluator_.Value(number), stored)) {
      Lose(place, "what the {0} {1} makes of {2} on {3} does not come over", who);
    } else if (!motion::KeptBelow(evaluator_).Of({number}, {}).empty()) {
      LoseForGood(
          place,
          "what the {0} {1} makes of {2} on {3} does not come over, and a bake cannot evaluate it either",
          who);
    }
  }

  bool IsSet(NodeId node, std::string_view attribute) const {
    return scene_.SourceOf(scene_.PlugOf(node, attribute)).has_value() ||
           scene_.Number(node, attribute).value_or(0.0) != 0.0;
  }

  bool Turns(NodeId node, std::string_view attribute) {
    const motion::NumberId number = evaluator_.Number(node, attribute);
    evaluator_.MoveTo(0.0);
    return evaluator_.Moves(number) || evaluator_.Value(number) != 0.0;
  }

  // Whether the node turns about two axes in another sequence than the import.
  bool TurnsInOtherOrder(NodeId node) {
    constexpr std::array<std::string_view, 6> kOrders = {"XYZ", "YZX", "ZXY", "XZY", "YXZ", "ZYX"};
    if (!IsSet(node, "rotateOrder")) return false;
    const double number = scene_.Number(node, "rotateOrder").value_or(0.0);
    // A driven order may be any.
    const std::string_view order =
        number >= 1.0 && number < 6.0 ? kOrders[static_cast<std::size_t>(number)] : kOrders.back();
    std::string turns;
    for (const char axis : order) {
      if (Turns(node, std::string("rotate") + axis)) turns += axis;
    }
    return !std::is_sorted(turns.begin(), turns.end());
  }

  // Checks the parts of a transform that an import does not read.
  void LookAtForm(NodeId node) {
    if (found_) return;
    const scene::Node& transform = scene_.node(node);
    const auto lose = [&](const char* what) {
      Lose(transform.place, "{0} of {1} does not come over", {what, ShownNode(scene_, node)});
    };
    if (!Inherits(scene_, node) && transform.parent != scene::kNoNode) {
      return lose("the independence from what stands above");
    }
    if (TurnsInOtherOrder(node)) return lose("the rotate order");
    struct Part {
      const char* shown;
      std::array<std::string_view, 3> attributes;
    };
    static constexpr Part kParts[] = {
        {"the rotate axis", {"rotateAxisX", "rotateAxisY", "rotateAxisZ"}},
        {"the shear", {"shearXY", "shearXZ", "shearYZ"}},
        {"the translation of the rotate pivot",
         {"rotatePivotTranslateX", "rotatePivotTranslateY", "rotatePivotTranslateZ"}},
        {"the translation of the scale pivot",
         {"scalePivotTranslateX", "scalePivotTranslateY", "scalePivotTranslateZ"}},
    };
    for (const Part& part : kParts) {
      for (const std::string_view attribute : part.attributes) {
        if (IsSet(node, attribute)) return lose(part.shown);
      }
    }
    if (scene_.Written(node, "offsetParentMatrix")) return lose("the offset parent matrix");
  }

  void LookAtLens(NodeId camera, const CameOver::Camera& layer) {
    if (found_) return;
    const std::string name = ShownNode(scene_, camera);
    const auto keys = FindKeys(scene_, camera, "focalLength", measures_);
    if (!keys) {
      LookAtDriver(camera, "focalLength", false);
    } else if (keys->curve.keys.size() > 1) {
      LookAtKeys(camera, *keys, layer.zoomKeys, std::nullopt);
      KeepFirstKey(camera, keys->curve.keys.front().time);
    } else if (layer.zoomKeys == 0) {
      LookAtSingle(camera, *keys);
    }
    for (const std::string_view aperture : {"horizontalFilmAperture", "verticalFilmAperture"}) {
      if (!found_) LookAtAperture(camera, aperture);
    }
    if (found_) return;
    const motion::SceneCamera lens(&evaluator_, camera);
    evaluator_.MoveTo(0.0);
    const motion::Camera now = lens.Now();
    const diag::Range place = scene_.node(camera).place;
    if (now.filmFit != motion::filmfit::kVertical &&
        motion::ResolvedFit(now, head_.picture) == motion::filmfit::kVertical) {
      Lose(place, "the film fit of {0} comes over as horizontal, and is vertical", {name});
    } else if (Differ(now.cameraScale, 1.0)) {
      Lose(place, "the camera scale of {0} does not come over", {name});
    } else if (Differ(now.lensSqueeze, 1.0)) {
      Lose(place, "the lens squeeze of {0} does not come over", {name});
    }
  }

  // No key of an aperture comes over.
  void LookAtAperture(NodeId camera, std::string_view attribute) {
    const auto keys = FindKeys(scene_, camera, attribute, measures_);
    if (keys && keys->curve.keys.size() == 1) return LookAtSingle(camera, *keys);
    if (keys) return LookAtKeys(camera, *keys, 0, std::nullopt);
    LookAtDriver(camera, attribute, false);
  }

  // In a unit that counts frames the first key of each node lands at time 0.
  void KeepFirstKey(NodeId node, double seconds) {
    if (!scene::CountsFrames(scene_.timeUnit().word)) return;
    if (!firstKey_) {
      firstKey_ = seconds;
    } else if (Differ(*firstKey_, seconds)) {
      Lose(scene_.node(node).place,
           "the keys of {0} begin at another frame than those below it, and come over from the same frame on",
           {ShownNode(scene_, node)});
    }
  }

  void LookAtPicture() {
    const motion::Picture& picture = head_.picture;
    const scene::NodeId resolution = scene_.Find("defaultResolution");
    const std::optional<diag::Range> said =
        resolution == scene::kNoNode ? std::nullopt : std::optional(scene_.node(resolution).place);
    constexpr double kNearlySame = 0.01;
    if (picture.width != import_.width || picture.height != import_.height ||
        std::fabs(motion::PixelAspect(picture) - import_.pixelAspect) > kNearlySame) {
      return Lose(said,
                  "the picture of {0} by {1}, pixel aspect {2}, comes over as {3} by {4}, pixel aspect {5}",
                  {RoundedNumber(picture.width), RoundedNumber(picture.height),
                   RoundedNumber(motion::PixelAspect(picture)), RoundedNumber(import_.width),
                   RoundedNumber(import_.height), RoundedNumber(import_.pixelAspect)});
    }
    const double rate = scene::TimeUnitOf(head_.timeUnit)->perSecond();
    constexpr double kSameRate = 1e-4;
    if (std::fabs(rate - import_.framesPerSecond) <= kSameRate * rate) return;
    const scene::UnitWord& unit = scene_.timeUnit();
    Lose(unit.word.empty() ? std::nullopt : std::optional(unit.place),
         "the rate of {0} frames a second comes over as {1}",
         {RoundedNumber(rate), RoundedNumber(import_.framesPerSecond)});
  }

  // Checks the locators of a scene from which nothing comes over.
  void LookAtLocators() {
    for (NodeId id = 0; id < scene_.nodes().size(); ++id) {
      const scene::Node& node = scene_.node(id);
      if (node.type != "locator" || node.origin != scene::Origin::Created) continue;
      const bool marked = scene::IsMarked(scene::ImportName(scene_, node));
      Lose(node.place,
           marked ? "the locator {0} does not come over without a camera"
                  : "the locator {0} has no \"null\" in its name",
           {ShownNode(scene_, id)});
      found_->comesWithBake = false;  // without a camera an import of a bake makes nothing either
      return;
    }
  }

  const scene::Scene& scene_;
  const CameOver& import_;
  diag::Collector ignored_;
  Head head_;
  motion::Evaluator evaluator_;
  motion::Measures measures_;
  std::optional<double> firstKey_;  // of the camera that is being checked, in seconds
  std::optional<Loss> found_;
  std::optional<Loss> unmended_;
};

}  // namespace

std::optional<Loss> FindLoss(const scene::Scene& scene, const CameOver& import) {
  return LossSearch(scene, import).Run();
}

}  // namespace bake
