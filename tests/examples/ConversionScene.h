// A random Maya scene of a camera and points before it: as text, and as what its own camera sees.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include "tests/examples/Matrix4.h"

namespace conversion {

// What kind of scene to make.
struct SceneTraits {
  bool pivots = false;           // rotate and scale pivots on parents and points
  bool nonUniformScale = false;  // on parents and points
  bool negativeScale = false;    // some of the factors are negative
  bool verticalFit = false;
  bool atThePole = false;  // every rotation about Y is a quarter turn
  double pixelAspect = 1.0;
  std::size_t keyCount = 0;  // 0: nothing moves
};

// One value per key; a value that does not move has one for all.
template <typename Value>
using Channel = std::vector<Value>;

struct Transform {
  std::string name;
  int parent = -1;  // index of a transform that stands before this one; -1: none
  Channel<Vector3> translate{{}};
  Channel<Vector3> rotate{{}};  // degrees
  Channel<Vector3> scale{{1.0, 1.0, 1.0}};
  Vector3 rotatePivot;
  Vector3 scalePivot;
};

// A position in the image in square pixels, from its centre, to the right and down.
struct Pixel {
  double x = 0.0;
  double y = 0.0;
};

class ConversionScene {
 public:
  ConversionScene(const SceneTraits& traits, std::uint64_t seed);

  std::string text() const;

  std::size_t keyCount() const { return traits_.keyCount; }
  std::size_t pointCount() const { return points_.size(); }
  std::string pointName(std::size_t point) const;  // of its locator

  // Where the scene's camera sees a place in the space of the point's locator, at a key (0 without keys).
  Pixel seen(std::size_t point, const Vector3& place, std::size_t key) const;

  int width() const { return width_; }
  int height() const { return height_; }

 private:
  double between(double low, double high);
  bool happens(double probability) { return between(0.0, 1.0) < probability; }
  Vector3 vectorBetween(double low, double high);
  Vector3 anyRotation();
  Vector3 anyScale();
  template <typename Draw>
  auto channel(bool moves, Draw draw);

  int addParent(const std::string& name, int parent);
  int addChain(const std::string& name, int length);
  void addCamera();
  void addPoint(std::size_t number);

  Matrix4 local(const Transform& node, std::size_t key) const;
  Matrix4 world(int node, std::size_t key) const;
  double imageSizePerSlope() const;

  void appendNode(std::string* out, const Transform& node) const;
  void appendCurves(std::string* out, const Transform& node) const;

  SceneTraits traits_;
  std::uint64_t state_;
  int width_ = 0;
  int height_ = 0;
  double aperture_[2] = {0.0, 0.0};  // horizontal, vertical; inches
  double focalLength_ = 0.0;         // millimetres
  std::vector<Transform> nodes_;
  int camera_ = -1;          // index of the camera's transform
  std::vector<int> points_;  // indices of the locators' transforms
};

}  // namespace conversion
