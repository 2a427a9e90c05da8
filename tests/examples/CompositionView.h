// What the camera of a composition sees: x to the right, y down, z away from the viewer.
#pragma once

#include <cstddef>
#include <string>

#include "refhost/Project.h"
#include "tests/examples/ConversionScene.h"
#include "tests/examples/Matrix4.h"

namespace conversion {

// A composition with one camera layer, which is not aimed.
class CompositionView {
 public:
  explicit CompositionView(const refhost::Composition& composition);

  bool hasCamera() const { return camera_ != nullptr; }
  const refhost::Layer* camera() const { return camera_; }
  const refhost::Layer* layer(const std::string& name) const;  // null when there is none

  // Where the camera sees a place in the layer's own space, at a key (of streams without keys: the value).
  Pixel seen(const refhost::Layer& layer, const Vector3& place, std::size_t key) const;

 private:
  const refhost::Composition& composition_;
  const refhost::Layer* camera_ = nullptr;
};

}  // namespace conversion
