// Rotations that are mixed.
#pragma once

#include "motion/Matrix.h"

namespace motion {

// A rotation a share of the way (0 to 1) from one to another, along the shorter arc. Both are rotations.
Matrix MixRotations(const Matrix& from, const Matrix& to, double share);

}  // namespace motion
