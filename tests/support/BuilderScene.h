// Scene texts in pieces: only the lines that a test of the composition builder needs.
#pragma once

#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace testsupport {

using SceneKeys = std::vector<std::pair<double, double>>;  // time, value

// The shortest text that gives the same double back.
std::string NumberText(double value);

// "//Maya ..." and the units.
std::string SceneHead(std::string_view units = "-l centimeter -a degree -t film");

// Square pixels of that size.
std::string RenderSize(int width, int height, double pixelAspect = 1.0);

// Nodes; further text such as "setAttr ..." can follow each.
std::string TransformText(std::string_view name, std::string_view parent = "");
std::string ConstraintText(std::string_view name);
std::string CameraText(std::string_view name, std::string_view transform);
std::string LocatorText(std::string_view name, std::string_view transform);

// setAttr of a triple of the node before.
std::string Triple(std::string_view attribute, double x, double y, double z);

// A curve with its keys, connected to a plug such as "camera1.tx".
std::string Animation(std::string_view plug, const SceneKeys& keys);

// Keys at times first, first + 1, ...
SceneKeys KeysFrom(double first, const std::vector<double>& values);

// The three links that make a constraint aim a camera's transform at a target.
std::string Aim(std::string_view constraint, std::string_view turned, std::string_view target);

}  // namespace testsupport
