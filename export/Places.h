// Where the layers of a composition stand at a frame. All is worked out when it is asked for.
//
// Frames count from 0 and are below the composition's. Aimed cameras have their resulting rotation.
#pragma once

#include <cstddef>

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

// Against its parent, and against the world. A circle of parents ends where it would come to a layer twice.
Matrix LocalAt(const Composition& composition, const Layer& layer, std::size_t frame);
Matrix WorldAt(const Composition& composition, std::size_t layer, std::size_t frame);

// Place and rotation of a camera in the world, without scale: what its picture depends on, with the lens.
Matrix ViewAt(const Composition& composition, std::size_t layer, std::size_t frame);

// The angle between the upper and the lower edge of the picture, in degrees.
double VerticalAngleAt(const Composition& composition, const Lens& lens, std::size_t frame);

}  // namespace interchange
