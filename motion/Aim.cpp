#include "motion/Aim.h"

#include <cmath>

namespace motion {
namespace {

// The direction of the part of a vector at right angles to a direction. False where that part comes only from
// rounding. Done twice, because the first difference has the rounding of a long vector.
bool SquareTo(const Vector& direction, Vector vector, Vector* square) {
  constexpr double kParallel = 1e-12;
  if (!Normalise(&vector)) return false;
  vector = vector - direction * Dot(vector, direction);
  if (Length(vector) < kParallel || !Normalise(&vector)) return false;
  vector = vector - direction * Dot(vector, direction);
  if (!Normalise(&vector)) return false;
  *square = vector;
  return true;
}

Vector AnySquare(const Vector& direction) {
  const bool awayFromX = std::fabs(direction.x) < 0.5;
  Vector square;
  SquareTo(direction, awayFromX ? Vector{1.0, 0.0, 0.0} : Vector{0.0, 1.0, 0.0}, &square);
  return square;
}

Matrix Frame(const Vector& direction, const Vector& square) {
  return {direction, square, Cross(direction, square), {}};
}

Vector PlaceOf(const ConstrainedNode& node) {
  return node.translate + node.rotatePivot + node.rotatePivotTranslate;
}

// The direction that counts as up at the node, in its parent's space.
Vector UpIn(const Aim& aim, const Matrix& toParent, const Vector& place) {
  switch (aim.upType) {
    case UpType::kScene:
      return TransformDirection({0.0, 1.0, 0.0}, toParent);
    case UpType::kObject:
      return TransformPoint(aim.upObject.origin, toParent) - place;
    case UpType::kObjectRotation:
      return TransformDirection(TransformDirection(aim.worldUp, aim.upObject), toParent);
    case UpType::kNone:
      return {};
    case UpType::kVector:
      break;
  }
  return TransformDirection(aim.worldUp, toParent);
}

// About a direction, right-handed.
Matrix RotationAboutDirection(const Vector& direction, double angle) {
  const Matrix frame = Frame(direction, AnySquare(direction));
  return Transposed(frame) * RotationAbout(0, angle) * frame;
}

}  // namespace

UpType UpTypeOf(int code) { return code < 0 || code > 4 ? UpType::kVector : static_cast<UpType>(code); }

bool MeanTarget(const std::vector<TargetPoint>& targets, Vector* mean) {
  Vector sum;
  double weights = 0.0;
  for (const TargetPoint& target : targets) {
    const Vector place = target.translate + target.rotatePivot + target.rotatePivotTranslate;
    sum = sum + TransformPoint(place, target.parentMatrix) * target.weight;
    weights += target.weight;
  }
  if (weights == 0.0) return false;
  *mean = {sum.x / weights, sum.y / weights, sum.z / weights};
  return IsFinite(*mean);
}

bool TurnTo(const Vector& from, const Vector& fromUp, const Vector& to, const Vector& toUp,
            Matrix* rotation) {
  Vector start = from;
  Vector end = to;
  if (!Normalise(&start) || !Normalise(&end)) return false;
  Vector startUp;
  Vector endUp;
  if (!SquareTo(start, fromUp, &startUp) || !SquareTo(end, toUp, &endUp)) {
    const Vector axis = Cross(start, end);
    if (!SquareTo(start, axis, &startUp)) startUp = AnySquare(start);
    if (!SquareTo(end, startUp, &endUp)) endUp = startUp;
  }
  *rotation = Transposed(Frame(start, startUp)) * Frame(end, endUp);
  return true;
}

bool AimAngles(const Aim& aim, const std::vector<TargetPoint>& targets, const ConstrainedNode& node,
               const Vector& near, Vector* angles) {
  Matrix toParent;
  Vector target;
  if (!Invert(node.parentMatrix, &toParent) || !MeanTarget(targets, &target)) return false;
  const Vector place = PlaceOf(node);
  const Vector direction = TransformPoint(target, toParent) - place;
  Matrix turn;
  if (!TurnTo(aim.aim, aim.up, direction, UpIn(aim, toParent, place), &turn)) return false;
  const bool twists = aim.upType == UpType::kScene || aim.upType == UpType::kVector;
  if (twists && aim.twist != 0.0) {
    Vector axis = direction;
    Normalise(&axis);
    turn = turn * RotationAboutDirection(axis, aim.twist);
  }
  const Matrix orient = RotationMatrix(node.jointOrient, RotateOrder::kXYZ);
  const Matrix rotation = RotationMatrix(aim.offset, RotateOrder::kXYZ) * turn * Transposed(orient);
  *angles = NearestAngles(AnglesOf(rotation, node.order, near), node.order, near);
  return true;
}

}  // namespace motion
