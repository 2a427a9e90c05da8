// Nodes with their attributes and keys.
#include "fuzz/SceneWords.h"
#include "tests/secondreader/SceneGenerator.h"

namespace secondreader {
namespace {

constexpr std::string_view kChannels[] = {"tx", "ty", "tz", "rx", "ry", "rz", "sx", "sy", "sz"};
constexpr std::string_view kLongChannels[] = {"translateX", "translateY", "translateZ", "rotateX", "rotateY",
                                              "rotateZ",    "scaleX",     "scaleY",     "scaleZ"};

bool isAngle(std::string_view channel) { return channel.front() == 'r'; }

}  // namespace

void SceneGenerator::createNode(std::string_view type, const std::string& name, const std::string& parent) {
  word(anyCase("createNode"));
  word(anyCase(type));
  if (odd()) words(dice_.chance(50) ? "-s" : "-ss on");
  if (odd()) words("-n \"earlier\"");
  const bool nameless = odd() && dice_.chance(20);
  if (!nameless) {
    word(anyCase(dice_.chance(80) ? "-n" : "-name"));
    if (odd() && dice_.chance(20)) {
      word("unquoted");
    } else {
      quoted(name);
    }
  }
  if (!parent.empty()) {
    word(anyCase(dice_.chance(80) ? "-p" : "-parent"));
    quoted(parent);
  }
  end();
}

// A chain of transforms with a camera or a locator below it.
void SceneGenerator::rig() {
  std::string parent;
  if (!transforms_.empty() && dice_.chance(25)) parent = knownName(transforms_);
  for (int depth = dice_.between(0, 3); depth >= 0; --depth) {
    const std::string name = odd() && !transforms_.empty() ? knownName(transforms_) : newName("group");
    // Sometimes a circle, or a name that is its own parent's.
    if (odd()) parent = dice_.chance(50) ? name : newName("group");
    createNode(dice_.chance(90) ? "transform" : "stereoRigTransform", name, parent);
    transforms_.push_back(name);
    transformAttributes();
    if (dice_.chance(45)) animateTransform(name);
    parent = name;
  }
  if (odd()) parent = knownName(transforms_);
  if (dice_.chance(65)) {
    const std::string camera = newName("cameraShape");
    createNode(dice_.chance(90) ? "camera" : "stereoRigCamera", camera, parent);
    cameras_.push_back(camera);
    cameraAttributes();
    if (dice_.chance(40)) animateFocalLength(camera);
    if (dice_.chance(35)) constraint(parent, knownName(transforms_));
  } else {
    static constexpr std::string_view kStems[] = {"nullShape", "myNull", "NULL_", "locatorShape", "nUll"};
    createNode("locator", newName(dice_.oneOf(kStems)), parent);
    if (odd()) words("setAttr \".t\" 1 2 3;");
  }
}

void SceneGenerator::transformAttributes() {
  static constexpr std::string_view kDistances[] = {".t",           ".translate", ".rp",
                                                    ".rotatePivot", ".sp",        ".scalePivot"};
  for (int count = dice_.between(0, 5); count > 0; --count) {
    // A node that is connected while it is current loses the connection with its next attribute.
    if (odd() && !transforms_.empty()) connect(knownName(curves_) + ".o", transforms_.back() + ".ty");
    word(anyCase("setAttr"));
    if (odd() && dice_.chance(30)) words("-k off");
    if (dice_.chance(60)) {
      quoted(anyCase(dice_.oneOf(kDistances)));
      triple(&SceneGenerator::number);
    } else if (dice_.chance(60)) {
      quoted(anyCase(dice_.chance(50) ? ".r" : ".rotate"));
      triple(&SceneGenerator::angle);
    } else if (dice_.chance(80)) {
      quoted(anyCase(dice_.chance(50) ? ".s" : ".scale"));
      triple(&SceneGenerator::factor);
    } else {
      quoted(dice_.chance(50) ? ".v" : ".t[0]");
      words("no 5");
    }
    end();
  }
}

void SceneGenerator::cameraAttributes() {
  static constexpr std::string_view kOdd[] = {"-k off", "-k", "-l on -k off"};
  static constexpr std::string_view kNearTwo[] = {
      "2.0000000000019", "2.0000000000021", "1.9999999999981", "1.9999999999979", "-2", "2e0", "1e9",
      "1.0000000000005"};
  for (int count = dice_.between(0, 4); count > 0; --count) {
    if (odd() && !cameras_.empty()) connect(knownName(curves_) + ".o", cameras_.back() + ".fl");
    word(anyCase("setAttr"));
    if (odd()) words(dice_.oneOf(kOdd));
    switch (dice_.between(0, 6)) {
      case 0:
        quoted(anyCase(dice_.chance(50) ? ".o" : ".orthographic"));
        word(dice_.chance(15) ? anyCase("yes") : "no");
        break;
      case 1:
        quoted(anyCase(dice_.chance(50) ? ".wci" : ".worldCenterOfInterest"));
        triple(&SceneGenerator::number);
        break;
      case 2:
        quoted(anyCase(dice_.chance(50) ? ".ff" : ".filmFit"));
        word(odd() ? std::string(dice_.oneOf(kNearTwo)) : std::to_string(dice_.between(0, 3)));
        if (odd()) word("2");
        break;
      case 3:
      case 4:
        quoted(anyCase(dice_.chance(50) ? ".fl" : ".focalLength"));
        word(odd() ? oddNumber() : std::to_string(dice_.between(12, 200)));
        break;
      case 5:
        quoted(anyCase(dice_.chance(50) ? ".cap" : ".cameraAperture"));
        words("-type \"double2\"");
        if (!odd()) word(odd() ? oddNumber() : "1." + std::to_string(dice_.between(1, 999)));
        if (!odd()) word("0." + std::to_string(dice_.between(1, 999)));
        break;
      default:
        quoted(dice_.chance(50) ? ".ncp" : ".t");
        word(number());
        break;
    }
    end();
  }
}

// A curve of so many keys, in one command or two.
void SceneGenerator::curve(const std::string& name, int keys, bool angles) {
  static constexpr std::string_view kTypes[] = {"animCurveTL", "animCurveTA", "animCurveTU"};
  static constexpr std::string_view kHeads[] = {"-s 3", "-k on", "-S", "-k", "-type \"x\"", "\".tan\" 18"};
  static constexpr std::string_view kFractions[] = {"", "", "", "", "", ".0", ".25", ".0005", ".9994"};
  createNode(dice_.oneOf(kTypes), name, "");
  curves_.push_back(name);
  if (dice_.chance(40)) words("setAttr \".tan\" 18;");
  int time = dice_.between(-5, 20);
  const int first = dice_.chance(15) ? dice_.between(0, keys) : keys;
  for (int key = 0; key < keys || key == 0; ++key) {
    if (key == 0 || key == first) {
      if (key > 0) end();
      word(anyCase("setAttr"));
      if (dice_.chance(60)) word("-s " + std::to_string(keys));
      if (odd()) words(dice_.oneOf(kHeads));
      const std::string range = "[0:" + std::to_string(keys) + "]";
      if (dice_.chance(85)) {
        quoted(".ktv" + range);
      } else if (dice_.chance(70)) {
        quoted(".keyTimeValue" + range);
      } else {
        quoted(odd() ? ".KTV[0]" : "x.keyTimeValue");
      }
    }
    if (keys == 0) break;
    word(odd() ? oddNumber() : std::to_string(time) + std::string(dice_.oneOf(kFractions)));
    if (key + 1 < keys || !odd()) word(angles ? angle() : number());
    time += odd() ? dice_.between(-3, 3) : dice_.between(1, 4);
  }
  end();
}

void SceneGenerator::animateTransform(const std::string& name) {
  const int keys = dice_.chance(10) ? dice_.between(0, 2) : dice_.between(2, 9);
  for (int count = dice_.between(1, 5); count > 0; --count) {
    const std::string_view channel = dice_.chance(60) ? dice_.oneOf(kChannels) : dice_.oneOf(kLongChannels);
    const std::string driver =
        odd() && dice_.chance(30) ? knownName(curves_) : name + "_" + std::string(channel);
    int own = keys;
    if (dice_.chance(8)) own = 1;
    if (odd() && dice_.chance(30)) own = dice_.between(0, 5);
    curve(driver, own, isAngle(channel));
    connect(driver + (dice_.chance(70) ? ".o" : ".output"), name + "." + anyCase(channel));
  }
}

void SceneGenerator::animateFocalLength(const std::string& camera) {
  const std::string driver = newName("focal");
  curve(driver, dice_.between(1, 5), false);
  connect(driver + ".o", camera + (dice_.chance(60) ? ".fl" : ".focalLength"));
}

// An aim constraint, wired as Maya writes it, with some parts left out.
void SceneGenerator::constraint(const std::string& turned, const std::string& target) {
  const std::string name = newName("aim");
  createNode(dice_.chance(50) ? "aimConstraint" : "lookAt", name, turned);
  transforms_.push_back(name);
  if (!odd()) connect(turned + ".t", name + anyCase(dice_.oneOf(fuzz::kFollowingAttributes)));
  if (!odd()) connect(target + ".t", name + ".target[0].targetTranslate");
  if (!odd()) connect(name + anyCase(dice_.oneOf(fuzz::kTurningAttributes)), turned + ".rx");
  if (odd()) connect(name + ".cameraW0", name + ".target[0].targetWeight");
}

}  // namespace secondreader
