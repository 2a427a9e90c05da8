#include "tests/support/BuilderScene.h"

#include <algorithm>
#include <charconv>
#include <cstddef>

namespace testsupport {
namespace {

std::string Quoted(std::string_view text) { return '"' + std::string(text) + '"'; }

std::string Node(std::string_view type, std::string_view name, std::string_view parent) {
  std::string text = "createNode " + std::string(type) + " -n " + Quoted(name);
  if (!parent.empty()) text += " -p " + Quoted(parent);
  return text + ";\n";
}

std::string Connect(std::string_view source, std::string_view destination) {
  return "connectAttr " + Quoted(source) + ' ' + Quoted(destination) + ";\n";
}

}  // namespace

std::string NumberText(double value) {
  char digits[32];
  const std::to_chars_result end = std::to_chars(digits, digits + sizeof digits, value);
  return std::string(digits, end.ptr);
}

std::string SceneHead(std::string_view units) {
  return "//Maya ASCII scene\ncurrentUnit " + std::string(units) + ";\n";
}

std::string RenderSize(int width, int height, double pixelAspect) {
  return "select -ne :defaultResolution;\n\tsetAttr \".w\" " + std::to_string(width) +
         ";\n\tsetAttr \".h\" " + std::to_string(height) + ";\n\tsetAttr \".pa\" " + NumberText(pixelAspect) +
         ";\n";
}

std::string TransformText(std::string_view name, std::string_view parent) {
  return Node("transform", name, parent);
}

std::string ConstraintText(std::string_view name) { return Node("aimConstraint", name, ""); }

std::string CameraText(std::string_view name, std::string_view transform) {
  return Node("camera", name, transform);
}

std::string LocatorText(std::string_view name, std::string_view transform) {
  return Node("locator", name, transform);
}

std::string Triple(std::string_view attribute, double x, double y, double z) {
  return "\tsetAttr " + Quoted(attribute) + " -type \"double3\" " + NumberText(x) + ' ' + NumberText(y) +
         ' ' + NumberText(z) + " ;\n";
}

std::string Animation(std::string_view plug, const SceneKeys& keys) {
  std::string name = "curve_" + std::string(plug);
  std::replace(name.begin(), name.end(), '.', '_');
  std::string text = Node("animCurveTL", name, "");
  if (!keys.empty()) {
    text += "\tsetAttr -s " + std::to_string(keys.size()) + " \".ktv[0:" + std::to_string(keys.size() - 1) +
            "]\" ";
    for (const auto& [time, value] : keys) text += ' ' + NumberText(time) + ' ' + NumberText(value);
    text += ";\n";
  }
  return text + Connect(name + ".o", plug);
}

SceneKeys KeysFrom(double first, const std::vector<double>& values) {
  SceneKeys keys;
  for (const double value : values) keys.emplace_back(first + static_cast<double>(keys.size()), value);
  return keys;
}

std::string Aim(std::string_view constraint, std::string_view turned, std::string_view target) {
  const std::string node(constraint);
  return Connect(std::string(turned) + ".t", node + ".ct") +
         Connect(std::string(target) + ".t", node + ".target[0].targetTranslate") +
         Connect(node + ".cr", std::string(turned) + ".r");
}

}  // namespace testsupport
