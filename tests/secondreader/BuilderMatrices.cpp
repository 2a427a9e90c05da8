// Static transforms, and the matrix that keys use too.
#include "tests/secondreader/Builder.h"

namespace secondreader {
namespace {

constexpr double kRadiansPerDegree = 0.017453292519943295;
constexpr double kDegreesPerRadian = 57.29577951308232;
constexpr double kPercent = 100.0;

}  // namespace

// The translation in points, the rotation in degrees.
MatrixComponents Builder::decomposed(const Transform& transform, Triple translate, Triple rotate,
                                     Triple scale) {
  Triple sp = transform.scalePivot;
  Triple rp = transform.rotatePivot;
  for (double& value : sp) value = convert_.distance(value);
  for (double& value : rp) value = convert_.distance(value);
  TransformMatrix matrix;
  check(MatrixSetIdentity(&matrix));
  check(MatrixTranslate(&matrix, -sp[0], sp[1], sp[2]));
  check(MatrixScale(&matrix, scale[0], scale[1], scale[2]));
  check(MatrixTranslate(&matrix, sp[0], -sp[1], -sp[2]));
  check(MatrixTranslate(&matrix, -rp[0], rp[1], rp[2]));
  check(MatrixRotateAxis(&matrix, 1.0, 0.0, 0.0, rotate[0] * kRadiansPerDegree));
  check(MatrixRotateAxis(&matrix, 0.0, 1.0, 0.0, rotate[1] * -kRadiansPerDegree));
  check(MatrixRotateAxis(&matrix, 0.0, 0.0, 1.0, rotate[2] * -kRadiansPerDegree));
  check(MatrixTranslate(&matrix, rp[0], -rp[1], -rp[2]));
  check(MatrixTranslate(&matrix, translate[0], -translate[1], -translate[2]));
  MatrixComponents components{};
  check(MatrixDecompose(&matrix, &components, nullptr));
  return components;
}

void Builder::setTransform(Handle layer, const Transform& transform) {
  Triple translate = transform.translate;
  Triple rotate = transform.rotate;
  for (double& value : translate) value = convert_.distance(value);
  for (double& value : rotate) value = convert_.angle(value);
  const MatrixComponents parts = decomposed(transform, translate, rotate, transform.scale);
  setStream(layer, 0, {});
  setStream(layer, 2, {parts.scale[0] * kPercent, parts.scale[1] * kPercent, parts.scale[2] * kPercent});
  setStream(layer, 8, {parts.rotation[0] * kDegreesPerRadian});
  setStream(layer, 9, {parts.rotation[1] * kDegreesPerRadian});
  setStream(layer, 3, {parts.rotation[2] * kDegreesPerRadian});
  setStream(layer, 1, {parts.translation[0], parts.translation[1], parts.translation[2]});
}

void Builder::setAnchor(Handle layer, const Transform& transform) {
  Triple point = transform.translate;
  for (double& value : point) value = convert_.distance(value);
  setStream(layer, 0, {point[0], -point[1], -point[2]});
}

}  // namespace secondreader
