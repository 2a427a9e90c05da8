// A node that is turned towards a point: look-at and aim constraints. Angles are radians.
#pragma once

#include <vector>

#include "motion/Matrix.h"
#include "motion/Rotation.h"

namespace motion {

// The values of one target that determine its place.
struct TargetPoint {
  Vector translate;
  Vector rotatePivot;
  Vector rotatePivotTranslate;
  Matrix parentMatrix;
  double weight = 1.0;
};

// The mean of the targets' places in the world, by weight. False where the weights add up to 0.
bool MeanTarget(const std::vector<TargetPoint>& targets, Vector* mean);

// The place of the constrained node, and how its angles are applied.
struct ConstrainedNode {
  Vector translate;
  Vector rotatePivot;
  Vector rotatePivotTranslate;
  Matrix parentMatrix;  // with the parent's own; not its inverse
  RotateOrder order = RotateOrder::kXYZ;
  Vector jointOrient;
};

// What keeps the node from rolling about its aim; the codes of the scene.
enum class UpType {
  kScene = 0,           // +Y
  kObject = 1,          // towards the place of an object
  kObjectRotation = 2,  // a direction in the space of an object
  kVector = 3,          // a direction in the world
  kNone = 4,            // nothing: the shortest turn
};

// The type of a code; kVector for every other number.
UpType UpTypeOf(int code);

struct Aim {
  Vector aim{1.0, 0.0, 0.0};      // of the node, turned to the target
  Vector up{0.0, 1.0, 0.0};       // of the node, turned up as far as possible
  Vector worldUp{0.0, 1.0, 0.0};  // the direction that counts as up
  UpType upType = UpType::kVector;
  Matrix upObject;     // for the two types with an object: its world matrix
  Vector offset;       // a rotation in XYZ order, before the turn
  double twist = 0.0;  // about the aim, of a scene's up or a vector's; a positive one is right-handed
};

// The angles that turn the node: in its order, nearest to `near`. False where there is no direction: weights
// that add up to 0, a target at the node's place, an aim of length 0, or a parent without an inverse.
bool AimAngles(const Aim& aim, const std::vector<TargetPoint>& targets, const ConstrainedNode& node,
               const Vector& near, Vector* angles);

// The rotation that takes `from` to `to`, and the part of `fromUp` at right angles to it to that of `toUp`.
// Where one of the two has no such part, the shortest turn. False where `from` or `to` has length 0.
bool TurnTo(const Vector& from, const Vector& fromUp, const Vector& to, const Vector& toUp, Matrix* rotation);

}  // namespace motion
