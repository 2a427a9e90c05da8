// Finds what an import did not bring, although it ended without an error.
#include <cmath>
#include <string>
#include <unordered_map>
#include <utility>

#include "bake/Head.h"
#include "bake/KeyedChannel.h"
#include "bake/Loss.h"
#include "bake/PlainForm.h"
#include "bake/Selection.h"
#include "diag/ShownText.h"
#include "motion/Evaluator.h"
#include "motion/KeptBelow.h"
#include "motion/SceneCamera.h"
#include "scene/Attributes.h"

namespace bake {
namespace {

using scene::NodeId;

constexpr double kTolerance = 1e-6;  // relative: scenes write values with limited digits

bool Differ(double a, double b) {
  return std::fabs(a - b) > kTolerance * std::fmax(1.0, std::fmax(std::fabs(a), std::fabs(b)));
}

std::string Digits(double number) {
  std::string text = std::to_string(number);
  text.erase(text.find_last_not_of('0') + 1);
  if (text.back() == '.') text.pop_back();
  return text;
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
    std::unordered_map<std::string_view, std::vector<const CameOver::Camera*>> byName;
    for (auto one = import_.cameras.rbegin(); one != import_.cameras.rend(); ++one) {
      byName[one->name].push_back(&*one);
    }
    bool any = false;
    for (NodeId id = 0; id < scene_.nodes().size() && !found_; ++id) {
      if (!IsSetUp(scene_, id)) continue;
      any = true;
      auto& layers = byName[scene_.node(id).name];
      if (layers.empty()) {
        Lose(scene_.node(id).place, "the camera " + ShownNode(scene_, id) + " does not come over");
        continue;
      }
      LookAtCamera(id, *layers.back());
      layers.pop_back();
    }
    if (any && !found_) LookAtPicture();
    if (!found_ && import_.layers == 0) LookAtLocators();
    return found_ ? found_ : unmended_;
  }

 private:
  void Lose(std::optional<diag::Range> place, std::string sentence) {
    if (!found_) found_ = Loss{.sentence = std::move(sentence), .place = place};
  }
  void LoseForGood(std::optional<diag::Range> place, std::string sentence) {
    if (!unmended_) {
      unmended_ = Loss{.sentence = std::move(sentence), .place = place, .comesWithBake = false};
    }
  }

  void LookAtCamera(NodeId camera, const CameOver::Camera& layer) {
    firstKey_.reset();
    std::size_t step = 0;
    for (NodeId node = scene_.node(camera).parent; node != scene::kNoNode && !found_;
         node = scene_.node(node).parent, ++step) {
      const bool own = step == 0;
      if (!own && (step > layer.above.size() || layer.above[step - 1].name != scene_.node(node).name)) {
        return Lose(scene_.node(camera).place,
                    "what stands above the camera " + ShownNode(scene_, camera) + " does not come over");
      }
      if (scene_.node(node).origin != scene::Origin::Created) {
        return LoseForGood(scene_.node(camera).place, "the camera " + ShownNode(scene_, camera) +
                                                          " stands under " + ShownNode(scene_, node) +
                                                          ", which is in another file");
      }
      LookAtPlace(node, own ? layer.keys : layer.above[step - 1].keys, own && layer.aimed);
      LookAtForm(node);
    }
    LookAtLens(camera, layer);
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
    const std::string name = ShownNode(scene_, node) + " on " + std::string(channel.attribute);
    const diag::Range place = scene_.node(channel.node).place;
    if (came == 0) return Lose(place, "no key of " + name + " comes over");
    if (first && !SameTimes(first->curve, channel.curve)) {
      return Lose(place, "the keys of " + name + " stand at other times than those on " +
                             std::string(first->attribute) + ", and come over at theirs");
    }
    if (IsCurvedBetweenFrames(channel.curve, measures_.framesPerSecond)) {
      Lose(place, "the path between the keys of " + name + " does not come over");
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
    Lose(scene_.node(channel.node).place, ShownNode(scene_, node) + " has a single key on " +
                                              std::string(channel.attribute) + ", which does not come over");
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
    const std::string by = " the " + std::string(lookAt ? "look-at " : "node ") +
                           ShownNode(scene_, driver->plug.node) + " makes of " + ShownNode(scene_, node) +
                           " on " + std::string(attribute) + " does not come over";
    const motion::NumberId number = evaluator_.Number(node, attribute);
    evaluator_.MoveTo(0.0);
    const double stored = scene_.Number(node, attribute).value_or(0.0);
    if (evaluator_.Moves(number) || Differ(evaluator_.Value(number), stored)) {
      Lose(place, "what" + by);
    } else if (!motion::KeptBelow(evaluator_).Of({number}, {}).empty()) {
      LoseForGood(place, "what" + by + ", and a bake cannot evaluate it either");
    }
  }

  bool IsSet(NodeId node, std::string_view attribute) const {
    return scene_.SourceOf(scene_.PlugOf(node, attribute)).has_value() ||
           scene_.Number(node, attribute).value_or(0.0) != 0.0;
  }

  // Checks the parts of a transform that an import does not read.
  void LookAtForm(NodeId node) {
    if (found_) return;
    const scene::Node& transform = scene_.node(node);
    const auto lose = [&](const char* what) {
      Lose(transform.place, std::string(what) + " of " + ShownNode(scene_, node) + " does not come over");
    };
    if (!Inherits(scene_, node) && transform.parent != scene::kNoNode) {
      return lose("the independence from what stands above");
    }
    const int turning = IsSet(node, "rotateX") + IsSet(node, "rotateY") + IsSet(node, "rotateZ");
    if (turning > 1 && IsSet(node, "rotateOrder")) return lose("the rotate order");
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
    if (transform.type == "joint") lose("the place");
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
      Lose(place, "the film fit of " + name + " comes over as horizontal, and is vertical");
    } else if (Differ(now.cameraScale, 1.0)) {
      Lose(place, "the camera scale of " + name + " does not come over");
    } else if (Differ(now.lensSqueeze, 1.0)) {
      Lose(place, "the lens squeeze of " + name + " does not come over");
    }
  }

  // No key of an aperture comes over.
  void LookAtAperture(NodeId camera, std::string_view attribute) {
    const auto keys = FindKeys(scene_, camera, attribute, measures_);
    if (keys && keys->curve.keys.size() == 1) return LookAtSingle(camera, *keys);
    if (keys) return LookAtKeys(camera, *keys, 0, std::nullopt);
    LookAtDriver(camera, attribute, false);
  }

  // The first key of each node lands at time 0.
  void KeepFirstKey(NodeId node, double seconds) {
    if (!firstKey_) {
      firstKey_ = seconds;
    } else if (Differ(*firstKey_, seconds)) {
      Lose(scene_.node(node).place, "the keys of " + ShownNode(scene_, node) +
                                        " begin at another frame than those below, and come over "
                                        "at the same");
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
      return Lose(said, "the picture of " + Digits(picture.width) + " by " + Digits(picture.height) +
                            ", pixel aspect " + Digits(motion::PixelAspect(picture)) + ", comes over as " +
                            Digits(import_.width) + " by " + Digits(import_.height) + ", pixel aspect " +
                            Digits(import_.pixelAspect));
    }
    const double rate = scene::TimeUnitOf(head_.timeUnit)->perSecond();
    constexpr double kSameRate = 1e-4;
    if (std::fabs(rate - import_.framesPerSecond) <= kSameRate * rate) return;
    const scene::UnitWord& unit = scene_.timeUnit();
    Lose(unit.word.empty() ? std::nullopt : std::optional(unit.place),
         "the rate of " + Digits(rate) + " frames a second comes over as " + Digits(import_.framesPerSecond));
  }

  // Checks the locators of a scene of which nothing at all comes over.
  void LookAtLocators() {
    for (NodeId id = 0; id < scene_.nodes().size(); ++id) {
      const scene::Node& node = scene_.node(id);
      if (node.type != "locator" || node.origin != scene::Origin::Created) continue;
      Lose(node.place, "the locator " + ShownNode(scene_, id) + " has no \"null\" in its name");
      found_->comesWithAllLocators = true;
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
