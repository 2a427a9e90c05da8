// The fixed factors between scene and host.
#pragma once

namespace mayaimport {

inline constexpr double kPointsPerInch = 72.0;
inline constexpr double kMillimetersPerInch = 25.4;
inline constexpr double kDegreesToRadians = 0.017453292519943295;
inline constexpr double kRadiansToDegrees = 57.29577951308232;
inline constexpr double kPercent = 100.0;

}  // namespace mayaimport
