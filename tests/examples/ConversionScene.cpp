#include "tests/examples/ConversionScene.h"
#include "tests/support/SplitMix.h"

#include <array>
#include <cstdio>

namespace conversion {
namespace {

constexpr std::size_t kPoints = 4;
constexpr double kMillimetresPerInch = 25.4;

template <typename Value>
const Value& at(const Channel<Value>& channel, std::size_t key) {
  return channel.size() == 1 ? channel[0] : channel[key];
}

std::string exact(double value) {
  std::array<char, 40> text;
  std::snprintf(text.data(), text.size(), "%.17g", value);
  return text.data();
}

std::string triple(const char* attribute, const Vector3& value) {
  return std::string("\tsetAttr \"") + attribute + "\" -type \"double3\" " + exact(value.x) + " " +
         exact(value.y) + " " + exact(value.z) + " ;\n";
}

std::string node(const std::string& type, const std::string& name, const std::string& parent) {
  std::string text = "createNode " + type + " -n \"" + name + "\"";
  if (!parent.empty()) text += " -p \"" + parent + "\"";
  return text + ";\n";
}

}  // namespace

ConversionScene::ConversionScene(const SceneTraits& traits, std::uint64_t seed)
    : traits_(traits), state_(seed) {
  width_ = static_cast<int>(between(320.0, 4096.0));
  height_ = static_cast<int>(between(240.0, 3112.0));
  aperture_[0] = between(0.4, 2.2);
  aperture_[1] = between(0.3, 1.6);
  focalLength_ = between(12.0, 135.0);
  addCamera();
  for (std::size_t point = 0; point < kPoints; ++point) addPoint(point);
}

double ConversionScene::between(double low, double high) {
  const std::uint64_t mixed = testsupport::SplitMix(&state_);
  constexpr double unit = 1.0 / 9007199254740992.0;  // 2^-53
  return low + (high - low) * (static_cast<double>(mixed >> 11) * unit);
}

Vector3 ConversionScene::vectorBetween(double low, double high) {
  const double x = between(low, high);
  const double y = between(low, high);
  const double z = between(low, high);
  return {x, y, z};
}

Vector3 ConversionScene::anyRotation() {
  Vector3 rotation = vectorBetween(-200.0, 200.0);
  if (traits_.atThePole) rotation.y = happens(0.5) ? 90.0 : -90.0;
  return rotation;
}

Vector3 ConversionScene::anyScale() {
  constexpr double smallest = 0.5;
  constexpr double largest = 2.0;
  Vector3 scale = {1.0, 1.0, 1.0};
  if (traits_.nonUniformScale) scale = vectorBetween(smallest, largest);
  if (traits_.negativeScale) {
    for (double* factor : {&scale.x, &scale.y, &scale.z}) {
      if (happens(0.5)) *factor = -*factor;
    }
  }
  return scale;
}

template <typename Draw>
auto ConversionScene::channel(bool moves, Draw draw) {
  Channel<decltype(draw())> values;
  const std::size_t count = moves ? traits_.keyCount : 1;
  for (std::size_t key = 0; key < count; ++key) values.push_back(draw());
  return values;
}

int ConversionScene::addParent(const std::string& name, int parent) {
  const auto moves = [&] { return traits_.keyCount > 0 && happens(0.6); };
  Transform node;
  node.name = name;
  node.parent = parent;
  node.translate = channel(moves(), [&] { return vectorBetween(-20.0, 20.0); });
  node.rotate = channel(moves(), [&] { return anyRotation(); });
  node.scale = channel(moves(), [&] { return anyScale(); });
  if (traits_.pivots) {
    node.rotatePivot = vectorBetween(-5.0, 5.0);
    node.scalePivot = vectorBetween(-5.0, 5.0);
  }
  nodes_.push_back(node);
  return static_cast<int>(nodes_.size()) - 1;
}

int ConversionScene::addChain(const std::string& name, int length) {
  int parent = -1;
  for (int depth = 0; depth < length; ++depth) parent = addParent(name + std::to_string(depth), parent);
  return parent;
}

// The camera's own transform has neither scale nor pivots.
void ConversionScene::addCamera() {
  const int parent = addChain("cameraGroup", static_cast<int>(between(0.0, 2.999)));
  Transform camera;
  camera.name = "camera";
  camera.parent = parent;
  const bool moves = traits_.keyCount > 0;
  camera.translate = channel(moves, [&] { return vectorBetween(-30.0, 30.0); });
  camera.rotate = channel(moves, [&] { return anyRotation(); });
  nodes_.push_back(camera);
  camera_ = static_cast<int>(nodes_.size()) - 1;
}

// A point's translation is worked out backwards, so that at every key it lies before the camera.
void ConversionScene::addPoint(std::size_t number) {
  const std::string prefix = "point" + std::to_string(number);
  const int parent = addChain(prefix + "Group", static_cast<int>(between(0.0, 2.999)));
  const int index = addParent(prefix, parent);
  Transform& point = nodes_[static_cast<std::size_t>(index)];
  const bool moves = traits_.keyCount > 0;
  point.translate = channel(false, [] { return Vector3{}; });
  Channel<Vector3> translate;
  for (std::size_t key = 0; key < (moves ? traits_.keyCount : 1); ++key) {
    const double depth = between(20.0, 80.0);
    const Vector3 before = {depth * between(-0.8, 0.8), depth * between(-0.8, 0.8), -depth};
    const Vector3 goal = world(parent, key).inverse() * (world(camera_, key) * before);
    const Vector3 start = local(point, key) * Vector3{};
    translate.push_back({goal.x - start.x, goal.y - start.y, goal.z - start.z});
  }
  point.translate = translate;
  points_.push_back(index);
}

// The importer takes every transform for one of rotate order XYZ: X acts first, then Y, then Z.
Matrix4 ConversionScene::local(const Transform& node, std::size_t key) const {
  const Vector3& rotate = at(node.rotate, key);
  const Matrix4 turned =
      Matrix4::rotation(2, rotate.z) * Matrix4::rotation(1, rotate.y) * Matrix4::rotation(0, rotate.x);
  const auto moved = [](const Vector3& by) { return Matrix4::translation(by); };
  const auto back = [](const Vector3& by) { return Matrix4::translation({-by.x, -by.y, -by.z}); };
  return moved(at(node.translate, key)) * moved(node.rotatePivot) * turned * back(node.rotatePivot) *
         moved(node.scalePivot) * Matrix4::scaling(at(node.scale, key)) * back(node.scalePivot);
}

Matrix4 ConversionScene::world(int node, std::size_t key) const {
  if (node < 0) return Matrix4();
  const Transform& transform = nodes_[static_cast<std::size_t>(node)];
  return world(transform.parent, key) * local(transform, key);
}

// How many square pixels of the image belong to a slope of 1 against the camera's axis.
double ConversionScene::imageSizePerSlope() const {
  const double focalInches = focalLength_ / kMillimetresPerInch;
  if (traits_.verticalFit) return height_ * focalInches / aperture_[1];
  return width_ * traits_.pixelAspect * focalInches / aperture_[0];
}

Pixel ConversionScene::seen(std::size_t point, const Vector3& place, std::size_t key) const {
  const Vector3 inWorld = world(points_[point], key) * place;
  const Vector3 inCamera = world(camera_, key).inverse() * inWorld;
  const double depth = -inCamera.z;
  return {imageSizePerSlope() * inCamera.x / depth, -imageSizePerSlope() * inCamera.y / depth};
}

std::string ConversionScene::pointName(std::size_t point) const {
  return nodes_[static_cast<std::size_t>(points_[point])].name + "_nullShape";
}

void ConversionScene::appendNode(std::string* out, const Transform& transform) const {
  const std::string parent =
      transform.parent < 0 ? "" : nodes_[static_cast<std::size_t>(transform.parent)].name;
  *out += node("transform", transform.name, parent);
  *out += triple(".t", transform.translate[0]) + triple(".r", transform.rotate[0]) +
          triple(".s", transform.scale[0]) + triple(".rp", transform.rotatePivot) +
          triple(".sp", transform.scalePivot);
}

void ConversionScene::appendCurves(std::string* out, const Transform& transform) const {
  struct Group {
    const char* type;
    const char* attribute;
    const Channel<Vector3>& values;
  };
  const Group groups[] = {{"animCurveTL", "translate", transform.translate},
                          {"animCurveTA", "rotate", transform.rotate},
                          {"animCurveTU", "scale", transform.scale}};
  for (const Group& group : groups) {
    if (group.values.size() < 2) continue;
    for (const auto& [axis, part] : {std::pair{"X", &Vector3::x}, {"Y", &Vector3::y}, {"Z", &Vector3::z}}) {
      const std::string curve = transform.name + "_" + group.attribute + axis;
      *out +=
          node(group.type, curve, "") + "\tsetAttr -s " + std::to_string(group.values.size()) + " \".ktv\" ";
      for (std::size_t key = 0; key < group.values.size(); ++key) {
        *out += " " + std::to_string(key + 1) + " " + exact(group.values[key].*part);
      }
      *out +=
          ";\nconnectAttr \"" + curve + ".o\" \"" + transform.name + "." + group.attribute + axis + "\";\n";
    }
  }
}

std::string ConversionScene::text() const {
  std::string out = "//Maya ASCII 2024 scene\ncurrentUnit -l centimeter -a degree -t film;\n";
  for (const Transform& transform : nodes_) appendNode(&out, transform);
  out += node("camera", "cameraShape", nodes_[static_cast<std::size_t>(camera_)].name);
  out += "\tsetAttr \".cap\" -type \"double2\" " + exact(aperture_[0]) + " " + exact(aperture_[1]) + " ;\n";
  out += "\tsetAttr \".fl\" " + exact(focalLength_) + ";\n";
  out += std::string("\tsetAttr \".ff\" ") + (traits_.verticalFit ? "2" : "1") + ";\n";
  for (std::size_t point = 0; point < points_.size(); ++point) {
    out += node("locator", pointName(point), nodes_[static_cast<std::size_t>(points_[point])].name);
  }
  for (const Transform& transform : nodes_) appendCurves(&out, transform);
  out += "select -ne :defaultResolution;\n\tsetAttr \".w\" " + std::to_string(width_) +
         ";\n\tsetAttr \".h\" " + std::to_string(height_) + ";\n\tsetAttr \".pa\" " +
         exact(traits_.pixelAspect) + ";\n";
  return out;
}

}  // namespace conversion
