// The matrix of one transform or joint. Angles are radians, lengths the scene's own.
#pragma once

#include "motion/Matrix.h"
#include "motion/Rotation.h"

namespace motion {

// The limits of a channel, each of which can be off.
struct Limit {
  double least = 0.0;
  double most = 0.0;
  bool hasLeast = false;
  bool hasMost = false;
};

double Limited(double value, const Limit& limit);

struct Shear {
  double xy = 0.0;
  double xz = 0.0;
  double yz = 0.0;
};

struct Transform {
  Vector translate;
  Vector rotate;
  Vector scale{1.0, 1.0, 1.0};
  Shear shear;
  RotateOrder order = RotateOrder::kXYZ;
  Vector rotateAxis;
  Vector rotatePivot;
  Vector rotatePivotTranslate;
  Vector scalePivot;
  Vector scalePivotTranslate;

  // A joint ignores the pivots and the shear above.
  bool isJoint = false;
  Vector jointOrient;
  bool segmentScale = true;
  Vector inverseScale{1.0, 1.0, 1.0};  // the scale of the parent joint, which segmentScale undoes

  Limit translateLimit[3];
  Limit rotateLimit[3];
  Limit scaleLimit[3];
};

// From the node's own space to its parent's, without the node's offset matrix.
Matrix LocalMatrix(const Transform& transform);

// What a transform loses when it is written as translation, rotation in XYZ order and scale.
enum class TransformForm {
  kPlain,    // nothing
  kPivoted,  // the rotate pivot and the scale pivot
  kOther,    // more
};

TransformForm FormOf(const Transform& transform);

// A matrix taken apart: scale first, then shear, rotation in XYZ order, translation.
struct MatrixParts {
  Vector translate;
  Vector rotate;
  Vector scale;
  Shear shear;
};

// A matrix that mirrors has a negative x scale. An axis of length 0 has scale 0 and no shear. `near` are the
// angles of the previous frame; the result is nearest to them. The matrix must be finite.
MatrixParts TakeApart(const Matrix& matrix, const Vector& near = {});

// The angles of a camera, in XYZ order. It looks along its third axis, even where the axes are not at right
// angles, and its second axis keeps its plane. `near` as above.
Vector ViewAngles(const Matrix& matrix, const Vector& near = {});

// The length of the longest axis over that of the shortest; infinite where one has length 0.
double Unevenness(const Matrix& matrix);

// The largest cosine between two axes of a matrix, which translation, rotation and scale cannot express. 0
// where all are at right angles.
double Skew(const Matrix& matrix);

}  // namespace motion
