#include "tests/check/GeneratedScene.h"

#include <array>
#include <string_view>
#include <vector>

#include "tests/support/SplitMix.h"

namespace check_test {
namespace {

constexpr std::array<std::string_view, 9> kChannels = {"tx", "ty", "tz", "rx", "ry", "rz", "sx", "sy", "sz"};
constexpr std::array<std::string_view, 6> kUnits = {"film", "pal", "ntsc", "game", "25fps", "sec"};

class Generator {
 public:
  explicit Generator(std::uint64_t seed) : random_(seed * 7919) {}

  std::string Run() {
    text_ = "//Maya ASCII 2018 scene\ncurrentUnit -l centimeter -a " +
            std::string(Chance(8) ? "radian" : "degree") + " -t " +
            std::string(kUnits[Below(kUnits.size())]) + ";\n";
    const std::size_t cameras = 1 + Below(3);
    for (std::size_t i = 0; i < cameras; ++i) Camera(std::to_string(i));
    return text_;
  }

 private:
  std::size_t Below(std::size_t bound) { return testsupport::SplitMix(&random_) % bound; }
  bool Chance(std::size_t of) { return Below(of) == 0; }
  std::string Number() { return std::to_string(static_cast<int>(Below(200)) - 100) + ".5"; }

  void Curve(const std::string& name, std::size_t keys, const std::string& plug, const std::string& type) {
    text_ += "createNode " + type + " -n \"" + name + "\";\n\tsetAttr \".tan\" 18;\n\tsetAttr -s " +
             std::to_string(keys) + " \".ktv[0:" + std::to_string(keys - 1) + "]\" ";
    const std::size_t step = 1 + Below(3);
    const bool close = Chance(12);
    for (std::size_t i = 0; i < keys; ++i) {
      const std::string time = close && i == 1 ? "1.0002" : std::to_string(1 + i * step);
      text_ += ' ' + time + ' ' + Number();
    }
    text_ += ";\nconnectAttr \"" + name + ".o\" \"" + plug + "\";\n";
  }

  void Place(const std::string& node) {
    const char* const option = Chance(10) ? "-l on " : "";
    text_ += std::string("\tsetAttr ") + option + "\".t\" -type \"double3\" " + Number() + ' ' + Number() +
             ' ' + Number() + " ;\n";
    if (Chance(2)) text_ += "\tsetAttr \".ro\" " + std::to_string(Below(6)) + ";\n";
    if (Chance(4)) text_ += "\tsetAttr \".rp\" -type \"double3\" 0 " + Number() + " 0 ;\n";
    if (Chance(10)) text_ += "\tsetAttr \".sy\" 2.5;\n";
    if (Chance(10)) text_ += "\tsetAttr \".xtxe\" yes;\n";
    if (Chance(10)) text_ += "\tsetAttr \".opm\" -type \"matrix\" 1 0 0 0 0 1 0 0 0 0 1 0 9 0 0 1 ;\n";
    moved_.push_back(node);
  }

  // Curves, a blend or a constraint, or nothing, for each channel.
  void Drive(const std::string& node) {
    const std::size_t keys = 1 + Below(4);
    for (const std::string_view channel : kChannels) {
      const std::string name = node + '_' + std::string(channel);
      const std::string plug = node + '.' + std::string(channel);
      const std::string type = channel[0] == 't'   ? "animCurveTL"
                               : channel[0] == 'r' ? "animCurveTA"
                                                   : "animCurveTU";
      switch (Below(10)) {
        case 0:
        case 1:
        case 2:
          Curve(name, keys + (Chance(40) ? 2 : 0), plug, type);
          break;
        case 3:
          Curve(name, 1, plug, type);
          break;
        case 4:
          text_ += "createNode unitConversion -n \"" + name + "_unit\";\n";
          Curve(name, keys, name + "_unit.i", type);
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
    text_ += "createNode transform -n \"" + aim + "_point\";\n\tsetAttr \".t\" -type \"double3\" 5 0 0 ;\n";
    text_ += "createNode aimConstraint -n \"" + aim + "\" -p \"" + camera + "\";\n";
    text_ += "connectAttr \"" + aim + ".constraintRotate\" \"" + camera + ".rotate\";\n";
    text_ += "connectAttr \"" + camera + ".translate\" \"" + aim + ".constraintTranslate\";\n";
    const bool longNames = Chance(2);
    text_ += "connectAttr \"" + aim + "_point.translate\" \"" + aim +
             (longNames ? ".target[0].targetTranslate" : ".tg[0].tt") + "\";\n";
    if (longNames && Chance(2)) {
      text_ += "connectAttr \"" + aim + ".pointW0\" \"" + aim + ".target[0].targetWeight\";\n";
    }
  }

  void Camera(const std::string& number) {
    std::string above;
    const std::size_t depth = Below(4);
    for (std::size_t i = 0; i < depth; ++i) {
      const std::string name = "rig" + number + '_' + std::to_string(i);
      text_ +=
          "createNode transform -n \"" + name + '"' + (above.empty() ? "" : " -p \"" + above + '"') + ";\n";
      Place(name);
      above = name;
    }
    const std::string camera = "cam" + number;
    text_ +=
        "createNode transform -n \"" + camera + '"' + (above.empty() ? "" : " -p \"" + above + '"') + ";\n";
    Place(camera);
    text_ += "createNode camera -n \"" + camera + "Shape\" -p \"" + camera + "\";\n\tsetAttr \".fl\" 24;\n";
    if (Chance(8)) text_ += "\tsetAttr \".o\" yes;\n";
    if (Chance(3)) text_ += "\tsetAttr \".ff\" " + std::to_string(Below(4)) + ";\n";
    if (Chance(3)) Curve(camera + "_zoom", 1 + Below(4), camera + "Shape.fl", "animCurveTU");
    for (const std::string& node : moved_) {
      if (node != camera || !Chance(4)) Drive(node);
      if (node == camera && Chance(2)) LookAt(camera);
    }
    moved_.clear();
  }

  std::uint64_t random_;
  std::vector<std::string> moved_;  // of one camera
  std::string text_;
};

}  // namespace

std::string GeneratedScene(std::uint64_t seed) { return Generator(seed).Run(); }

}  // namespace check_test
