// Where the layers of a composition stand at a frame. Each call computes its result anew.
//
// Frames count from 0 and are below the composition's. The rotation of an aimed camera includes its aim.
#pragma once

#include <cstddef>
#include <vector>

#include "export/Composition.h"
#include "export/Matrix.h"

namespace interchange {

// The values of three channels at a frame.
Vector VectorAt(const Channel (&channels)[3], std::size_t frame);

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

// The layers against the world, frame after frame. Parents are computed before their children, so each layer
// is computed once a frame, however deep the layers are nested.
class Worlds {
 public:
  // Of a writable composition, which outlives the object. With `camerasAlone` only cameras and the layers
  // above them are computed.
  explicit Worlds(const Composition& composition, bool camerasAlone = false);

  // Before the first call all layers stand at the origin.
  void GoTo(std::size_t frame);

  const Matrix& Of(std::size_t layer) const { return matrices_[layer]; }

  // Place and rotation of a camera, without scale. Its picture depends on these and on the lens.
  Matrix ViewOf(std::size_t layer) const { return RigidOf(matrices_[layer]); }

 private:
  const Composition& composition_;
  std::vector<std::size_t> order_;  // each after its parent
  std::vector<Matrix> matrices_;
};

// The angle between the upper and the lower edge of the picture: in radians, for a zoom; and in degrees, for
// a lens at a frame.
double VerticalRadians(const Composition& composition, double zoom);
double VerticalAngleAt(const Composition& composition, const Lens& lens, std::size_t frame);

}  // namespace interchange
