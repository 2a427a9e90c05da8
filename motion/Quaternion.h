// Mixing of rotations.
#pragma once

#include "motion/Matrix.h"

namespace motion {

// The rotation at a share (0 to 1) of the shorter arc from one rotation to another.
Matrix MixRotations(const Matrix& from, const Matrix& to, double share);

}  // namespace motion
