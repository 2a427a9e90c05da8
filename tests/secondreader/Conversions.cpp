#include "tests/secondreader/Conversions.h"

#include <cmath>

#include "tests/secondreader/Numbers.h"

namespace secondreader {
namespace {

constexpr double kThousand = 1000.0;
constexpr double kPointsPerInch = 72.0;
constexpr double kMillimetersPerInch = 25.4;
constexpr double kRadiansPerDegree = 0.017453292519943295;
constexpr int kCustomRate = 12;

}  // namespace

double Conversions::distance(double value) const {
  if (!linearUnits_) return value;
  switch (scene_.linearUnit) {
    case 1:
      return value / kMillimetersPerInch * kPointsPerInch;
    case 3:
      return value * 100.0 / 0.0254 * kPointsPerInch;
    case 4:
      return value * kThousand * 100.0 * kPointsPerInch;
    case 5:
      return value * kPointsPerInch;
    case 6:
      return value * 12.0 * kPointsPerInch;
    case 7:
      return value * 36.0 * kPointsPerInch;
    case 8:
      return value * 5280.0 * 12.0 * kPointsPerInch;
    default:
      return value / 2.54 * kPointsPerInch;
  }
}

double Conversions::angle(double value) const {
  return scene_.angleUnit == 2 ? value * kRadiansPerDegree : value;
}

T_Time Conversions::time(double value, bool first) {
  double factor = 1.0;
  switch (scene_.timeUnit) {
    case 1:
      factor = 3600.0;
      break;
    case 2:
      factor = 60.0;
      break;
    case 4:
      factor = 0.001;
      break;
    case 5:
      factor = 15.0;
      break;
    case 6:
      factor = 24.0;
      break;
    case 7:
      factor = 25.0;
      break;
    case 8:
      factor = 30.0;
      break;
    case 9:
      factor = 48.0;
      break;
    case 10:
      factor = 50.0;
      break;
    case 11:
      factor = 60.0;
      break;
    case kCustomRate:
      factor = scene_.frameRate > 0.0 ? scene_.frameRate : 29.97;
      break;
    default:
      break;
  }
  const bool frames = scene_.timeUnit >= 6 && scene_.timeUnit <= kCustomRate;
  if (frames && first) offset_ = value;
  return {wholePart((value - offset_) * kThousand + 0.5), wholePartUnsigned(factor * kThousand)};
}

T_Time Conversions::longestAnimation() const {
  if (scene_.curves.empty()) return {29970, 2997};
  double longest = 0.0;
  for (const Curve& curve : scene_.curves) {
    if (curve.keys != nullptr && !curve.keys->empty() && curve.keys->back().time > longest) {
      longest = curve.keys->back().time;
    }
  }
  if (!(longest > 0.0)) longest = 10.0;
  T_Time duration{wholePart((longest - offset_) * kThousand + 0.5), 1000};
  switch (scene_.timeUnit) {
    case 1:
      duration.scale = 3600000;
      break;
    case 2:
      duration.scale = 60000;
      break;
    case 4:
      duration.scale = 1;
      break;
    case 5:
      duration.scale = 15000;
      break;
    case 6:
      duration.scale = 24000;
      break;
    case 7:
      duration.scale = 25000;
      break;
    case 8:
      duration.scale = 30000;
      break;
    case 9:
      duration.scale = 48000;
      break;
    case 10:
      duration.scale = 50000;
      break;
    case 11:
      duration.scale = 60000;
      break;
    case kCustomRate:
      duration.scale = scene_.frameRate > 0.0 ? wholePartUnsigned(scene_.frameRate * kThousand) : 29970;
      break;
    default:
      break;
  }
  return duration;
}

HostRatio Conversions::frameRate() const {
  switch (scene_.timeUnit) {
    case 5:
      return {15, 1};
    case 6:
      return {24, 1};
    case 7:
      return {25, 1};
    case 9:
      return {48, 1};
    case 10:
      return {50, 1};
    case 11:
      return {60, 1};
    case kCustomRate:
      return {wholePart(scene_.frameRate * kThousand), 1000};
    default:
      return {30, 1};
  }
}

HostRatio Conversions::pixelAspect() const {
  if (std::fabs(scene_.pixelAspect - 1.0) < 0.01) return {1000, 1000};
  return {wholePart(scene_.pixelAspect * kThousand), 1000};
}

double Conversions::filmSize(const Camera& camera) const {
  return (camera.verticalFit ? camera.verticalAperture : camera.horizontalAperture) * kPointsPerInch;
}

double Conversions::zoom(const Camera& camera, double focalLength) const {
  const double focal = focalLength * kPointsPerInch / kMillimetersPerInch;
  const double size = camera.verticalFit ? static_cast<double>(scene_.height)
                                         : static_cast<double>(scene_.width) * scene_.pixelAspect;
  return size * focal / filmSize(camera);
}

}  // namespace secondreader
