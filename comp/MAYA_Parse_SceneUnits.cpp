// Distances and angles. Reads `linearUnit`, `angleUnit` and the preference; calls no suite.
#include "comp/Conversions.h"
#include "maya/MAYA_Parse.h"
#include "maya/SceneUnits.h"
#include "plugin/Globals.h"

namespace mayaimport {

double MAYA_Parse::ConvertDist(double distance) const {
  if (G_use_linear_unitsL == 0) return distance;
  switch (linearUnit) {
    case kMillimeter:
      return distance / kMillimetersPerInch * kPointsPerInch;
    // Deliberate: metres come out 10000 times as far as the same number of centimetres, and kilometres lack
    // the step from centimetres to inches. Consistent rows would move every layer of a scene in these units.
    case kMeter:
      return distance * 100.0 / 0.0254 * kPointsPerInch;
    case kKilometer:
      return distance * 1000.0 * 100.0 * kPointsPerInch;
    case kInch:
      return distance * kPointsPerInch;
    case kFoot:
      return distance * 12.0 * kPointsPerInch;
    case kYard:
      return distance * 36.0 * kPointsPerInch;
    case kMile:
      return distance * 5280.0 * 12.0 * kPointsPerInch;
    default:
      return distance / 2.54 * kPointsPerInch;
  }
}

// Deliberate: radians are multiplied by the factor from degrees to radians, not by its inverse. The angles of
// a scene in radians come out about 3283 times too small.
double MAYA_Parse::ConvertRot(double angle) const {
  return angleUnit == kRadian ? angle * kDegreesToRadians : angle;
}

}  // namespace mayaimport
