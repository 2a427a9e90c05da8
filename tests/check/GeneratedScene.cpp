#include "tests/check/GeneratedScene.h"

#include <array>
#include <string_view>
#include <vector>

#include "tests/support/SplitMix.h"

namespace check_test {
namespace {

constexpr std::array<std::string_view, 9> kChannels = {"tx", "ty", "tz", "rx", "ry", "rz", "sx", "sy", "sz"};
constexpr std::array<std::string_view, 9> kLongNames = {
    "translateX", "translateY", "translateZ", "rotateX", "rotateY", "rotateZ", "scaleX", "scaleY", "scaleZ"};
constexpr std::array<std::string_view, 11> kRates = {"film", "pal",   "ntsc",  "game",      "25fps", "sec",
                                                     "show", "ntscf", "30fps", "23.976fps", "film"};
constexpr std::array<std::string_view, 6> kLengths = {"centimeter", "centimeter", "m", "in", "cm", "mm"};

class Generator {
 public:
  explicit Generator(std::uint64_t seed) : random_(seed * 7919) {}

  std::string Run() {
    text_ = "//Maya ASCII 2018 scene\n";
    if (!Chance(20)) {
      text_ += "currentUnit -l " + std::string(kLengths[Below(kLengths.size())]) + " -a " +
               (Chance(8) ? "radian" : "degree") + " -t " + std::string(kRates[Below(kRates.size())]) + ";\n";
    }
    if (Chance(2)) {
      text_ +=
          "createNode transform -s -n \"persp\";\ncreateNode camera -s -n \"perspShape\" -p \"persp\";\n"
          "createNode transform -s -n \"top\";\ncreateNode camera -s -n \"topShape\" -p \"top\";\n"
          "\tsetAttr \".o\" yes;\n";
    }
    const std::size_t cameras = Chance(10) ? 0 : 1 + Below(3);
    for (std::size_t i = 0; i < cameras; ++i) Camera(std::to_string(i));
    const std::size_t locators = Below(3);
    for (std::size_t i = 0; i < locators; ++i) Locator(std::to_string(i));
    if (Chance(2)) Resolution();
    return text_;
  }

 private:
  std::size_t Below(std::size_t bound) { return testsupport::SplitMix(&random_) % bound; }
  bool Chance(std::size_t of) { return Below(of) == 0; }
  std::string Number() { return std::to_string(static_cast<int>(Below(200)) - 100) + ".5"; }
  std::string Factor() { return std::to_string(Below(3)) + ".7" + std::to_string(Below(10)); }
  std::string Numbers() { return Number() + ' ' + Number() + ' ' + Number(); }

  void Set(const std::string& attribute, const std::string& numbers) {
    text_ += "\tsetAttr \"" + attribute + "\" -type \"double3\" " + numbers + " ;\n";
  }

  void Curve(const std::string& name, std::size_t keys, const std::string& plug, std::string_view type,
             std::size_t first, std::size_t step) {
    text_ += "createNode " + std::string(type) + " -n \"" + name + "\";\n\tsetAttr \".tan\" " +
             (Chance(2) ? "18" : "2") + ";\n\tsetAttr -s " + std::to_string(keys) +
             " \".ktv[0:" + std::to_string(keys - 1) + "]\" ";
    for (std::size_t i = 0; i < keys; ++i) text_ += ' ' + std::to_string(first + i * step) + ' ' + Number();
    text_ += ";\nconnectAttr \"" + name + (Chance(3) ? ".output" : ".o") + "\" \"" + plug + "\";\n";
  }

  void Resolution() {
    text_ +=
        "select -ne :defaultResolution;\n\tsetAttr \".w\" 1920;\n\tsetAttr \".h\" 1080;\n\tsetAttr \".pa\" "
        "1;\n"
        "\tsetAttr \".dar\" 1.7777777;\n";
  }

  // What stands still of a transform.
  void Place(const std::string& node) {
    Set(Chance(5) ? ".translate" : ".t", Numbers());
    if (Chance(6)) text_ += "\tsetAttr \".tx\" " + Number() + ";\n";
    if (Chance(6)) text_ += "\tsetAttr -l on \".ry\" " + Number() + ";\n";
    if (Chance(2)) Set(".r", Numbers());
    if (Chance(5)) Set(".s", Factor() + ' ' + Factor() + ' ' + Factor());
    if (Chance(2)) text_ += "\tsetAttr \".ro\" " + std::to_string(Below(6)) + ";\n";
    if (Chance(4)) Set(".rp", "0 " + Number() + " 0");
    if (Chance(8)) Set(".sp", Numbers());
    if (Chance(12)) Set(".ra", Numbers());
    if (Chance(12)) Set(".rpt", Numbers());
    if (Chance(16)) Set(".spt", "0 0 " + Number());
    if (Chance(16)) Set(".sh", Factor() + " 0 0");
    if (Chance(16)) text_ += "\tsetAttr \".it\" no;\n";
    if (Chance(16)) text_ += "\tsetAttr \".opm\" -type \"matrix\" 1 0 0 0 0 1 0 0 0 0 1 0 9 0 0 1 ;\n";
    if (Chance(16)) text_ += "\tsetAttr \".xtxe\" yes;\n\tsetAttr \".mxtx\" 20;\n";
    moved_.push_back(node);
  }

  // Curves, a conversion of a curve or a constraint, or nothing, for each channel.
  void Drive(const std::string& node, const std::string& path) {
    const std::size_t keys = 1 + Below(4);
    const std::size_t first = Chance(3) ? Below(12) : first_;
    const std::size_t step = Chance(20) ? 0 : 1 + Below(3);
    for (std::size_t i = 0; i < kChannels.size(); ++i) {
      const std::string_view channel = kChannels[i];
      const std::string name = node + '_' + std::string(channel);
      const std::string plug =
          (Chance(40) ? path : node) + '.' + std::string(Chance(3) ? kLongNames[i] : channel);
      const std::string_view type = channel[0] == 't'   ? "animCurveTL"
                                    : channel[0] == 'r' ? "animCurveTA"
                                                        : "animCurveTU";
      switch (Below(10)) {
        case 0:
        case 1:
        case 2:
          Curve(name, keys + (Chance(60) ? 2 : 0), plug, type, first, Chance(15) ? step + 1 : step);
          break;
        case 3:
          Curve(name, 1, plug, type, first + (Chance(4) ? 1 : 0), 1);
          break;
        case 4:
          text_ += "createNode unitConversion -n \"" + name + "_unit\";\n";
          Curve(name, keys, name + "_unit.i", type, first, step);
          text_ += "connectAttr \"" + name + "_unit.o\" \"" + plug + "\";\n";
          break;
        case 5:
          text_ += "createNode pointConstraint -n \"" + name + "_hold\" -p \"" + node +
                   "\";\nconnectAttr \"" + name + "_hold.ctx\" \"" + plug + "\";\n";
          break;
        default:
          break;
      }
    }
  }

  void LookAt(const std::string& camera) {
    const std::string aim = camera + "_aim";
    text_ += "createNode transform -n \"" + aim + "_point\";\n";
    Set(".t", Numbers());
    text_ += "createNode aimConstraint -n \"" + aim + "\" -p \"" + camera + "\";\n";
    text_ += "connectAttr \"" + aim + ".constraintRotate\" \"" + camera + ".rotate\";\n";
    if (!Chance(6))
      text_ += "connectAttr \"" + camera + ".translate\" \"" + aim + ".constraintTranslate\";\n";
    const bool longNames = !Chance(3);
    text_ += "connectAttr \"" + aim + "_point.translate\" \"" + aim +
             (longNames ? ".target[0].targetTranslate" : ".tg[0].tt") + "\";\n";
    if (longNames && Chance(3)) {
      text_ += "connectAttr \"" + aim + ".pointW0\" \"" + aim + ".target[0].targetWeight\";\n";
    }
    if (Chance(2)) Drive(aim + "_point", '|' + aim + "_point");
  }

  // Makes transforms above each other; hands out the lowest, and its path. Now and then the importer does not
  // find one of them: a joint, or one that is given as a path.
  std::string Chain(const std::string& prefix, std::size_t depth, std::string* path) {
    std::string above;
    for (std::size_t i = 0; i < depth; ++i) {
      // Now and then two names that differ in case alone.
      const std::string name =
          (Chance(60) ? "RIG" : "rig") + (Chance(60) ? "0" : prefix) + '_' + std::to_string(i);
      text_ += "createNode " + std::string(Chance(20) ? "joint" : "transform") + " -n \"" + name + '"' +
               (above.empty() ? "" : " -p \"" + (Chance(20) ? *path : above) + '"') + ";\n";
      *path += '|' + name;
      Place(name);
      above = name;
    }
    return above;
  }

  void Camera(const std::string& number) {
    std::string path;
    first_ = 1 + Below(12);
    const std::string above = Chain(number, Below(4), &path);
    const std::string camera = "cam" + number;
    text_ +=
        "createNode transform -n \"" + camera + '"' + (above.empty() ? "" : " -p \"" + above + '"') + ";\n";
    path += '|' + camera;
    Place(camera);
    text_ += "createNode " + std::string(Chance(10) ? "stereoRigCamera" : "camera") + " -n \"" + camera +
             "Shape\" -p \"" + camera + "\";\n\tsetAttr \".fl\" 24;\n";
    if (Chance(8)) text_ += "\tsetAttr \".o\" yes;\n";
    if (Chance(3)) text_ += "\tsetAttr \".ff\" " + std::to_string(Below(4)) + ";\n";
    if (Chance(2))
      text_ += "\tsetAttr \".cap\" -type \"double2\" 1." + std::to_string(Below(10)) + " 0.5 ;\n";
    if (Chance(12)) text_ += "\tsetAttr \".lsr\" 2;\n";
    if (Chance(12)) text_ += "\tsetAttr \".cs\" 1.5;\n";
    if (Chance(3))
      Curve(camera + "_zoom", 1 + Below(4), camera + "Shape.fl", "animCurveTU", first_ + Below(3),
            1 + Below(3));
    DriveAll(camera);
    if (Chance(4)) LookAt(camera);
  }

  void DriveAll(const std::string& own) {
    std::string path;
    const bool still = Chance(4);
    for (const std::string& node : moved_) {
      path += '|' + node;
      if (!still && (node != own || !Chance(4))) Drive(node, path);
    }
    moved_.clear();
  }

  void Locator(const std::string& number) {
    std::string path;
    first_ = 1 + Below(12);
    const std::string own = Chain("9" + number, 1 + Below(3), &path);
    const std::string_view mark = Chance(2) ? "_null" : "";
    text_ += "createNode locator -n \"" + own + std::string(mark) + "Shape\" -p \"" + own + "\";\n";
    DriveAll(own);
  }

  std::uint64_t random_;
  std::vector<std::string> moved_;  // of one camera or locator
  std::size_t first_ = 1;           // where its chain begins
  std::string text_;
};

}  // namespace

std::string GeneratedScene(std::uint64_t seed) { return Generator(seed).Run(); }

}  // namespace check_test
