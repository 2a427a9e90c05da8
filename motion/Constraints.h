// Point, orient, parent and scale constraints. Angles are radians.
#pragma once

#include <vector>

#include "motion/Aim.h"
#include "motion/Matrix.h"
#include "motion/Rotation.h"

namespace motion {

// The translation that puts the node on the mean of its targets, plus `offset` in its parent's space. False
// where the weights add up to 0 or the parent matrix has no inverse.
bool PointConstraint(const std::vector<TargetPoint>& targets, const ConstrainedNode& node,
                     const Vector& offset, Vector* translate);

// The values of one target that determine its rotation.
struct TargetRotation {
  Vector rotate;
  RotateOrder order = RotateOrder::kXYZ;
  Vector jointOrient;
  Matrix parentMatrix;
  double weight = 1.0;
};

// The angles that turn the node as its targets are turned, `offset` first. Several targets are mixed along
// the shorter arc; that rule is an assumption. False as above.
bool OrientConstraint(const std::vector<TargetRotation>& targets, const ConstrainedNode& node,
                      const Vector& offset, const Vector& near, Vector* angles);

// A target of a parent constraint: its whole transform, and the node's place and rotation in its space.
struct TargetParent {
  Vector translate;
  Vector rotate;
  Vector scale{1.0, 1.0, 1.0};
  RotateOrder order = RotateOrder::kXYZ;
  Vector jointOrient;
  Vector rotatePivot;
  Vector rotatePivotTranslate;
  Matrix parentMatrix;
  Vector offsetTranslate;
  Vector offsetRotate;
  double weight = 1.0;
};

struct Pose {
  Vector translate;
  Vector rotate;
};

// The pose of a node that follows its targets as it would follow a parent. Of several targets the places are
// averaged and the rotations mixed; that rule is an assumption. False as above.
bool ParentConstraint(const std::vector<TargetParent>& targets, const ConstrainedNode& node,
                      const Vector& near, Pose* pose);

struct TargetScale {
  Vector scale{1.0, 1.0, 1.0};
  Matrix parentMatrix;
  double weight = 1.0;
};

// The scale that makes the node as large in the world as the mean of its targets, times `offset`. False as
// above, and where the parent has an axis of length 0.
bool ScaleConstraint(const std::vector<TargetScale>& targets, const Matrix& parentMatrix,
                     const Vector& offset, Vector* scale);

}  // namespace motion
