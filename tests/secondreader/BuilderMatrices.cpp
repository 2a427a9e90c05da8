// Static transforms, and the matrix that keys use too.
#include "hostapi/LayerStreams.h"
#include "tests/secondreader/AngleRounding.h"
#include "tests/secondreader/Builder.h"

namespace secondreader {
namespace {

constexpr double kRadiansPerDegree = 0.017453292519943295;
constexpr double kDegreesPerRadian = 57.29577951308232;
constexpr double kPercent = 100.0;

Triple reversed(const Triple& point) { return {-point[0], -point[1], -point[2]}; }

}  // namespace

// The host's Y and Z axes point the other way.
Triple Builder::hostPoint(const Triple& point) const {
  return {convert_.distance(point[0]), -convert_.distance(point[1]), -convert_.distance(point[2])};
}

// The translation in points; the rotation in radians. What is turned about Y or Z in the scene turns the
// other way in the host.
Parts Builder::decomposed(const Transform& transform, const Triple& translate, const Triple& rotate,
                          const Triple& scale) const {
  HostError code = HOST_ERR_NONE;
  const bool nothing = suites_.host().serviceFails("MatrixDecompose", &code);
  check(code);
  if (nothing) return {};
  const Triple scalePivot = hostPoint(transform.scalePivot);
  const Triple rotatePivot = hostPoint(transform.rotatePivot);
  Matrix matrix = identity();
  matrix = after(translation(reversed(scalePivot)), matrix);
  matrix = after(scaling(scale), matrix);
  matrix = after(translation(scalePivot), matrix);
  matrix = after(translation(reversed(rotatePivot)), matrix);
  matrix = after(rotation(0, convert_.angle(rotate[0]) * kRadiansPerDegree), matrix);
  matrix = after(rotation(1, convert_.angle(rotate[1]) * -kRadiansPerDegree), matrix);
  matrix = after(rotation(2, convert_.angle(rotate[2]) * -kRadiansPerDegree), matrix);
  matrix = after(translation(rotatePivot), matrix);
  matrix = after(translation(hostPoint(translate)), matrix);
  const auto parts = takeApart(matrix);
  check(parts ? HOST_ERR_NONE : HOST_ERR_MATRIX_NOT_FINITE);
  return *parts;
}

void Builder::setTransform(Handle layer, const Transform& transform) {
  const Parts parts = decomposed(transform, transform.translate, transform.rotate, transform.scale);
  const Rounding rounding = roundingAfter(transform.rotate);
  const auto setAngle = [&](std::int32_t stream, double angle) {
    setStream(layer, stream, {angle * kDegreesPerRadian, 0.0, 0.0, AngleRounding().first(angle)});
  };
  setStream(layer, HOST_STREAM_ANCHOR_POINT, {});
  setStream(layer, HOST_STREAM_SCALE,
            {parts.scale[0] * kPercent, parts.scale[1] * kPercent, parts.scale[2] * kPercent, rounding});
  setAngle(HOST_STREAM_ROTATION_X, parts.rotation[0]);
  setAngle(HOST_STREAM_ROTATION_Y, parts.rotation[1]);
  setAngle(HOST_STREAM_ROTATION_Z, parts.rotation[2]);
  setStream(layer, HOST_STREAM_POSITION,
            {parts.translation[0], parts.translation[1], parts.translation[2], rounding});
}

void Builder::setAnchor(Handle layer, const Transform& transform) {
  const Triple point = hostPoint(transform.translate);
  setStream(layer, HOST_STREAM_ANCHOR_POINT, {point[0], point[1], point[2]});
}

}  // namespace secondreader
