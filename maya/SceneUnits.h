// The codes of the scene's units. The numbers are fixed; any other value is treated as the row "every other"
// of each conversion.
#pragma once

#include <cstdint>

namespace mayaimport {

enum LinearUnit : std::int32_t {
  kMillimeter = 1,
  kCentimeter = 2,
  kMeter = 3,
  kKilometer = 4,
  kInch = 5,
  kFoot = 6,
  kYard = 7,
  kMile = 8,
};

enum AngleUnit : std::int32_t { kDegree = 1, kRadian = 2 };

enum TimeUnit : std::int32_t {
  kHour = 1,
  kMinute = 2,
  kSecond = 3,
  kMillisecond = 4,
  kGame = 5,        // 15 frames per second
  kFilm = 6,        // 24
  kPal = 7,         // 25
  kNtsc = 8,        // 30
  kShow = 9,        // 48
  kPalField = 10,   // 50
  kNtscField = 11,  // 60
  kCustomRate = 12,
};

}  // namespace mayaimport
