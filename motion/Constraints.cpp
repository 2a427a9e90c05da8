#include "motion/Constraints.h"

#include "motion/Quaternion.h"

namespace motion {
namespace {

// The mean of rotations by weight, which are added one after the other.
class MeanRotation {
 public:
  void Add(const Matrix& rotation, double weight) {
    if (weight == 0.0) return;
    weights_ += weight;
    mean_ = weights_ == weight ? rotation : MixRotations(mean_, rotation, weight / weights_);
  }
  bool Valid() const { return weights_ != 0.0 && IsFinite(mean_); }
  const Matrix& Mean() const { return mean_; }

 private:
  Matrix mean_;
  double weights_ = 0.0;
};

// From a rotation in the world to the angles of the node.
Vector NodeAngles(const Matrix& world, const ConstrainedNode& node, const Vector& near) {
  const Matrix local = world * Transposed(RotationOf(node.parentMatrix)) *
                       Transposed(RotationMatrix(node.jointOrient, RotateOrder::kXYZ));
  return NearestAngles(AnglesOf(local, node.order, near), node.order, near);
}

Matrix Turned(const Vector& rotate, RotateOrder order, const Vector& jointOrient) {
  return RotationMatrix(rotate, order) * RotationMatrix(jointOrient, RotateOrder::kXYZ);
}

Vector AxisLengths(const Matrix& matrix) { return {Length(matrix.x), Length(matrix.y), Length(matrix.z)}; }

}  // namespace

bool PointConstraint(const std::vector<TargetPoint>& targets, const ConstrainedNode& node,
                     const Vector& offset, Vector* translate) {
  Matrix toParent;
  Vector mean;
  if (!Invert(node.parentMatrix, &toParent) || !MeanTarget(targets, &mean)) return false;
  *translate = TransformPoint(mean, toParent) - node.rotatePivot - node.rotatePivotTranslate + offset;
  return true;
}

bool OrientConstraint(const std::vector<TargetRotation>& targets, const ConstrainedNode& node,
                      const Vector& offset, const Vector& near, Vector* angles) {
  MeanRotation mean;
  for (const TargetRotation& target : targets) {
    const Matrix turned = Turned(target.rotate, target.order, target.jointOrient);
    mean.Add(turned * RotationOf(target.parentMatrix), target.weight);
  }
  if (!mean.Valid()) return false;
  *angles = NodeAngles(RotationMatrix(offset, RotateOrder::kXYZ) * mean.Mean(), node, near);
  return true;
}

bool ParentConstraint(const std::vector<TargetParent>& targets, const ConstrainedNode& node,
                      const Vector& near, Pose* pose) {
  Matrix toParent;
  if (!Invert(node.parentMatrix, &toParent)) return false;
  MeanRotation mean;
  Vector places;
  double weights = 0.0;
  for (const TargetParent& target : targets) {
    const Matrix turned = Turned(target.rotate, target.order, target.jointOrient);
    const Vector held = TransformDirection(target.offsetTranslate, Scaling(target.scale) * turned);
    const Vector place = held + target.rotatePivot + target.rotatePivotTranslate + target.translate;
    places = places + TransformPoint(place, target.parentMatrix) * target.weight;
    weights += target.weight;
    mean.Add(
        RotationMatrix(target.offsetRotate, RotateOrder::kXYZ) * turned * RotationOf(target.parentMatrix),
        target.weight);
  }
  if (weights == 0.0 || !mean.Valid()) return false;
  pose->translate =
      TransformPoint(places * (1.0 / weights), toParent) - node.rotatePivot - node.rotatePivotTranslate;
  pose->rotate = NodeAngles(mean.Mean(), node, near);
  return true;
}

bool ScaleConstraint(const std::vector<TargetScale>& targets, const Matrix& parentMatrix,
                     const Vector& offset, Vector* scale) {
  const Vector parent = AxisLengths(parentMatrix);
  if (parent.x == 0.0 || parent.y == 0.0 || parent.z == 0.0) return false;
  Vector sum{};
  double weights = 0.0;
  for (const TargetScale& target : targets) {
    const Vector lengths = AxisLengths(target.parentMatrix);
    const Vector inWorld{target.scale.x * lengths.x, target.scale.y * lengths.y, target.scale.z * lengths.z};
    sum = sum + inWorld * target.weight;
    weights += target.weight;
  }
  if (weights == 0.0) return false;
  for (const int axis : {0, 1, 2}) (*scale)[axis] = sum[axis] / weights / parent[axis] * offset[axis];
  return IsFinite(*scale);
}

}  // namespace motion
