#include "motion/Transform.h"

#include <algorithm>
#include <cmath>

namespace motion {
namespace {

Vector LimitedChannel(const Vector& values, const Limit (&limits)[3]) {
  return {Limited(values.x, limits[0]), Limited(values.y, limits[1]), Limited(values.z, limits[2])};
}

Matrix ShearMatrix(const Shear& shear) {
  return {{1.0, 0.0, 0.0}, {shear.xy, 1.0, 0.0}, {shear.xz, shear.yz, 1.0}, {}};
}

// A parent's scale of 0 cannot be undone.
double Inverse(double scale) { return scale == 0.0 ? 1.0 : 1.0 / scale; }

Matrix JointMatrix(const Transform& joint, const Vector& translate, const Matrix& turned,
                   const Vector& scale) {
  const Vector& parent = joint.inverseScale;
  const Matrix inverse =
      joint.segmentScale ? Scaling({Inverse(parent.x), Inverse(parent.y), Inverse(parent.z)}) : Matrix{};
  return Scaling(scale) * turned * RotationMatrix(joint.jointOrient, RotateOrder::kXYZ) * inverse *
         Translation(translate);
}

bool IsZero(const Vector& vector) { return vector == Vector{}; }

bool Limits(const Vector& values, const Limit (&limits)[3]) {
  return LimitedChannel(values, limits) != values;
}

// The cosine between two axes, 0 where one has no length.
double Cosine(const Vector& a, const Vector& b) {
  const double lengths = Length(a) * Length(b);
  return lengths > 0.0 ? std::fabs(Dot(a, b)) / lengths : 0.0;
}

}  // namespace

double Limited(double value, const Limit& limit) {
  if (limit.hasLeast && value < limit.least) value = limit.least;
  if (limit.hasMost && value > limit.most) value = limit.most;
  return value;
}

Matrix LocalMatrix(const Transform& transform) {
  const Vector translate = LimitedChannel(transform.translate, transform.translateLimit);
  const Vector rotate = LimitedChannel(transform.rotate, transform.rotateLimit);
  const Vector scale = LimitedChannel(transform.scale, transform.scaleLimit);
  const Matrix turned =
      RotationMatrix(transform.rotateAxis, RotateOrder::kXYZ) * RotationMatrix(rotate, transform.order);
  if (transform.isJoint) return JointMatrix(transform, translate, turned, scale);
  const Vector beforeTurn = transform.scalePivot + transform.scalePivotTranslate - transform.rotatePivot;
  return Translation(-transform.scalePivot) * Scaling(scale) * ShearMatrix(transform.shear) *
         Translation(beforeTurn) * turned *
         Translation(transform.rotatePivot + transform.rotatePivotTranslate + translate);
}

TransformForm FormOf(const Transform& transform) {
  const bool limited = Limits(transform.translate, transform.translateLimit) ||
                       Limits(transform.rotate, transform.rotateLimit) ||
                       Limits(transform.scale, transform.scaleLimit);
  if (transform.order != RotateOrder::kXYZ || !IsZero(transform.rotateAxis) || limited) {
    return TransformForm::kOther;
  }
  if (transform.isJoint) {
    const bool unscaled = !transform.segmentScale || transform.inverseScale == Vector{1.0, 1.0, 1.0};
    return IsZero(transform.jointOrient) && unscaled ? TransformForm::kPlain : TransformForm::kOther;
  }
  const bool sheared = transform.shear.xy != 0.0 || transform.shear.xz != 0.0 || transform.shear.yz != 0.0;
  if (sheared || !IsZero(transform.rotatePivotTranslate) || !IsZero(transform.scalePivotTranslate)) {
    return TransformForm::kOther;
  }
  const bool pivoted = !IsZero(transform.rotatePivot) || !IsZero(transform.scalePivot);
  return pivoted ? TransformForm::kPivoted : TransformForm::kPlain;
}

MatrixParts TakeApart(const Matrix& matrix, const Vector& near) {
  MatrixParts parts;
  parts.translate = matrix.origin;
  Matrix upright = WithoutOrigin(matrix);
  const double mirror = Determinant(upright) < 0.0 ? -1.0 : 1.0;
  upright.x = upright.x * mirror;
  const Matrix rotation = RotationOf(upright);
  parts.scale = {mirror * Length(upright.x), Dot(upright.y, rotation.y), Dot(upright.z, rotation.z)};
  parts.shear.xy = parts.scale.y == 0.0 ? 0.0 : Dot(upright.y, rotation.x) / parts.scale.y;
  parts.shear.xz = parts.scale.z == 0.0 ? 0.0 : Dot(upright.z, rotation.x) / parts.scale.z;
  parts.shear.yz = parts.scale.z == 0.0 ? 0.0 : Dot(upright.z, rotation.y) / parts.scale.z;
  parts.rotate = NearestAngles(AnglesOf(rotation, RotateOrder::kXYZ, near), RotateOrder::kXYZ, near);
  return parts;
}

Vector ViewAngles(const Matrix& matrix, const Vector& near) {
  const Matrix turned = RotationOf({matrix.z, matrix.y, -matrix.x, {}});
  const Matrix view = {Cross(turned.y, turned.x), turned.y, turned.x, {}};
  return NearestAngles(AnglesOf(view, RotateOrder::kXYZ, near), RotateOrder::kXYZ, near);
}

double Unevenness(const Matrix& matrix) {
  const auto [least, most] = std::minmax({Length(matrix.x), Length(matrix.y), Length(matrix.z)});
  return most == 0.0 ? INFINITY : most / least;
}

double Skew(const Matrix& matrix) {
  return std::max({Cosine(matrix.x, matrix.y), Cosine(matrix.y, matrix.z), Cosine(matrix.z, matrix.x)});
}

}  // namespace motion
