// Times, rates and aspects. Reads `timeUnit`, `frameRate`, `pixelAspect` and the curves; reads and writes the
// process-wide time offset; calls no suite.
#include <algorithm>
#include <cmath>

#include "hostutil/HostNumbers.h"
#include "maya/ListAccess.h"
#include "maya/MAYA_Parse.h"
#include "maya/SceneUnits.h"
#include "plugin/Globals.h"

namespace mayaimport {

namespace {

// One row per time unit, one column per use.
struct Rate {
  double unitsPerSecond;         // of key times
  bool frameBased;               // whether a first key becomes time 0
  std::int32_t framesPerSecond;  // of the composition
};

// Deliberate: hours, minutes and milliseconds are used as units per second like every rate, so that a key at
// 1 h comes out at 1/3600 s; and "game", although a rate, does not move the time offset.
constexpr Rate kRates[] = {
    {1.0, false, 30},     // every other code
    {3600.0, false, 30},  // hour
    {60.0, false, 30},    // min
    {1.0, false, 30},     // sec
    {0.001, false, 30},   // millisec
    {15.0, false, 15},    // game
    {24.0, true, 24},     // film
    {25.0, true, 25},     // pal
    {30.0, true, 30},     // ntsc
    {48.0, true, 48},     // show
    {50.0, true, 50},     // palf
    {60.0, true, 60},     // ntscf
};

constexpr double kFallbackRate = 29.97;     // of key times, where a custom rate is not positive
constexpr double kTimeResolution = 1000.0;  // host time values per scene time unit
constexpr double kRatioResolution = 1000.0;
constexpr auto kRatioDenominator = static_cast<std::uint32_t>(kRatioResolution);

constexpr T_Time kDurationWithoutCurves{29970, 2997};
constexpr double kDurationWithoutKeys = 10.0;  // in the scene's time unit

constexpr double kSquarePixelTolerance = 0.01;

Rate RateOf(std::int32_t timeUnit, double customRate) {
  if (timeUnit == kCustomRate) return {customRate > 0.0 ? customRate : kFallbackRate, true, 0};
  const bool known = timeUnit >= kHour && timeUnit <= kNtscField;
  return kRates[known ? timeUnit : 0];
}

T_Time HostTime(double sceneTime, const Rate& rate) {
  return {TruncateToInt32((sceneTime - G_time_offsetD) * kTimeResolution + 0.5),
          TruncateToUInt32(rate.unitsPerSecond * kTimeResolution)};
}

}  // namespace

void MAYA_Parse::ResetOffset() { G_time_offsetD = 0.0; }

// Deliberate: every node's first key moves the offset anew, so that all animated nodes of a frame-based scene
// start at time 0, whatever frame their animation starts at.
T_Time MAYA_Parse::ConvertTime(double time, std::uint8_t first) const {
  const Rate rate = RateOf(timeUnit, frameRate);
  if (rate.frameBased && first != 0) G_time_offsetD = time;
  return HostTime(time, rate);
}

T_Time MAYA_Parse::FindLongestAnimation() const {
  if (curves == nullptr) return kDurationWithoutCurves;
  double latest = 0.0;
  const std::int64_t curveCount = RecordCount(curves);
  for (std::int64_t i = 0; i < curveCount; ++i) {
    const auto curve = FetchRecord<MAYA_AnimCurve>(curves, i);
    const std::int64_t keyCount = RecordCount(curve.keys);
    // Deliberate: the last key by position, not the latest one.
    if (keyCount > 0) latest = std::max(latest, FetchRecord<MAYA_Key>(curve.keys, keyCount - 1).time);
  }
  return HostTime(latest > 0.0 ? latest : kDurationWithoutKeys, RateOf(timeUnit, frameRate));
}

// Deliberate: a custom rate that is not positive is passed on as it is, although key times fall back
// to 29.97.
HostRatio MAYA_Parse::FindFrameRate() const {
  if (timeUnit == kCustomRate) return {TruncateToInt32(frameRate * kRatioResolution), kRatioDenominator};
  return {RateOf(timeUnit, frameRate).framesPerSecond, 1};
}

HostRatio MAYA_Parse::FindPixelAspectRatio() const {
  if (std::fabs(pixelAspect - 1.0) < kSquarePixelTolerance) return {kRatioDenominator, kRatioDenominator};
  return {TruncateToInt32(pixelAspect * kRatioResolution), kRatioDenominator};
}

double MAYA_Parse::CalculateHSF() const { return pixelAspect; }

}  // namespace mayaimport
