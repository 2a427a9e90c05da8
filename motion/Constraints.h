// Point, orient, parent and scale constraints. Angles are radians.
#pragma once

#include <vector>

#include "motion/Aim.h"
#include "motion/Matrix.h"
#include "motion/Rotation.h"

namespace motion {

// The translation that puts the node on the mean of its targets, plus `offset` in its parent's space. Fails
// where the weights add up to nothing or the parent cannot be undone.
bool PointConstraint(const std::vector<TargetPoint>& targets, const ConstrainedNode& node,
                     const Vector& offset, Vector* translate);

// What a constraint takes from one target to find how it is turned.
struct TargetRotation {
  Vector rotate;
  RotateOrder order = RotateOrder::kXYZ;
  Vector jointOrient;
  Matrix parentMatrix;
  double weight = 1.0;
};

// The angles that turn the node as its targets are turned, `offset` first. Several targets are mixed along
// the shorter arc, which no fact confirms. Fails as above.
bool OrientConstraint(const std::vector<TargetRotation>& targets, const ConstrainedNode& node,
                      const Vector& offset, const Vector& near, Vector* angles);

// A target of a parent constraint: all of its transform, and where the node is held in its space.
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

// The pose of a node that is held by its targets as by a parent. Of several targets the places are averaged
// and the turns mixed, which no fact confirms. Fails as above.
bool ParentConstraint(const std::vector<TargetParent>& targets, const ConstrainedNode& node,
                      const Vector& near, Pose* pose);

struct TargetScale {
  Vector scale{1.0, 1.0, 1.0};
  Matrix parentMatrix;
  double weight = 1.0;
};

// The scale that makes the node as large in the world as the mean of its targets, times `offset`. Fails as
// above, and where the parent has an axis of no length.
bool ScaleConstraint(const std::vector<TargetScale>& targets, const Matrix& parentMatrix,
                     const Vector& offset, Vector* scale);

}  // namespace motion
