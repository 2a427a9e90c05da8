// Rotations as three angles about the axes. Radians; positive turns x to y, y to z, z to x.
#pragma once

#include "motion/Matrix.h"

namespace motion {

// The order of the rotations about the axes; the codes of the scene.
enum class RotateOrder { kXYZ = 0, kYZX = 1, kZXY = 2, kXZY = 3, kYXZ = 4, kZYX = 5 };

// The order of a code; XYZ for every other number.
RotateOrder RotateOrderOf(int code);

// `angles` are about x, y and z, whatever the order.
Matrix RotationMatrix(const Vector& angles, RotateOrder order);

// About one axis: 0, 1, 2 for x, y, z.
Matrix RotationAbout(int axis, double angle);

// The angles of a rotation, the second one of the order between -90° and 90°. Where that one is at ±90°, only
// the sum or the difference of the others is fixed: the last one is then taken to be that of `near`.
Vector AnglesOf(const Matrix& rotation, RotateOrder order, const Vector& near = {});

// The angles of the same rotation that lie nearest to `near`: shifted by whole turns, or replaced by the
// other three angles that give the rotation. Angles so large that a turn changes nothing stay.
Vector NearestAngles(const Vector& angles, RotateOrder order, const Vector& near);

}  // namespace motion
