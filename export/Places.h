// Where the layers of a composition stand at a frame. All is worked out when it is asked for.
//
// Frames count from 0 and are below the composition's. Aimed cameras have their resulting rotation.
#pragma once

#include <cstddef>
#include <vector>

#include "export/Composition.h"
#include "export/Matrix.h"

namespace interchange {

// A layer against its parent: scale, then rotation, then position.
struct Place {
  Vector position;
  Quaternion rotation;
  Vector scale{1.0, 1.0, 1.0};
};

Place LocalPlaceAt(const Composition& composition, const Layer& layer, std::size_t frame);

// The rotation alone, as a matrix: with the aim, without position and scale.
Matrix LocalRotationAt(const Composition& composition, const Layer& layer, std::size_t frame);

// Against its parent.
Matrix LocalAt(const Composition& composition, const Layer& layer, std::size_t frame);

// The layers against the world, frame after frame: each is its parent's matrix, which is there already, and
// its own place, so that however deep layers are nested, each is worked out once a frame.
class Worlds {
 public:
  // Of a writable composition, which outlives the object. With `camerasAlone` only cameras and what they hang
  // on are worked out.
  explicit Worlds(const Composition& composition, bool camerasAlone = false);

  // Before the first call all stand at the origin.
  void GoTo(std::size_t frame);

  const Matrix& Of(std::size_t layer) const { return matrices_[layer]; }

  // Place and rotation of a camera, without scale: what its picture depends on, with the lens.
  Matrix ViewOf(std::size_t layer) const { return RigidOf(matrices_[layer]); }

 private:
  const Composition& composition_;
  std::vector<std::size_t> order_;  // each after its parent
  std::vector<Matrix> matrices_;
};

// The angle between the upper and the lower edge of the picture, in degrees.
double VerticalAngleAt(const Composition& composition, const Lens& lens, std::size_t frame);

}  // namespace interchange
