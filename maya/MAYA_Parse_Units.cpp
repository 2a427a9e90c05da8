// "currentUnit": the units of the scene's numbers. Writes `linearUnit`, `angleUnit`, `timeUnit` and
// `frameRate`; calls no suite.
#include <span>

#include "maya/MAYA_Parse.h"
#include "maya/SceneUnits.h"
#include "maya/TokenText.h"
#include "maya/Words.h"

namespace mayaimport {

namespace {

struct UnitName {
  std::string_view name;
  std::int32_t code;
};

constexpr UnitName kLinearUnits[] = {
    {"mm", kMillimeter}, {"millimeter", kMillimeter},
    {"cm", kCentimeter}, {"centimeter", kCentimeter},
    {"m", kMeter},       {"meter", kMeter},
    {"km", kKilometer},  {"kilometer", kKilometer},
    {"in", kInch},       {"inch", kInch},
    {"ft", kFoot},       {"foot", kFoot},
    {"yd", kYard},       {"yard", kYard},
    {"mi", kMile},       {"mile", kMile},
};

constexpr UnitName kAngleUnits[] = {
    {"deg", kDegree}, {"degree", kDegree}, {"rad", kRadian}, {"radian", kRadian}};

constexpr UnitName kTimeUnits[] = {
    {"hour", kHour}, {"min", kMinute},    {"sec", kSecond},      {"millisec", kMillisecond},
    {"game", kGame}, {"film", kFilm},     {"pal", kPal},         {"ntsc", kNtsc},
    {"show", kShow}, {"palf", kPalField}, {"ntscf", kNtscField},
};

// Sets the unit to the one named; an unknown name leaves it as it is.
void SetUnit(std::string_view name, std::span<const UnitName> units, std::int32_t* unit) {
  for (const UnitName& known : units) {
    if (!SameWord(name, known.name)) continue;
    *unit = known.code;
    return;
  }
}

enum class UnitOption { Linear, Angle, Time, Other };

UnitOption FindUnitOption(std::string_view option) {
  if (SameWord(option, "-l") || SameWord(option, "-linear")) return UnitOption::Linear;
  if (SameWord(option, "-a") || SameWord(option, "-angle")) return UnitOption::Angle;
  if (SameWord(option, "-t") || SameWord(option, "-time")) return UnitOption::Time;
  return UnitOption::Other;
}

}  // namespace

void MAYA_Parse::ParseCurrentUnit() {
  const char* first = nullptr;
  const char* last = nullptr;
  for (MayaToken kind = Unknown; kind != Semicolon;) {
    kind = NextInCommand(&first, &last);
    if (kind != Option) continue;
    const UnitOption option = FindUnitOption(WordText(first, last));
    if (option == UnitOption::Other) continue;
    kind = NextInCommand(&first, &last);
    if (kind == Number && option == UnitOption::Time) {
      timeUnit = kCustomRate;
      frameRate = ScanNumber(first, last);
    }
    if (kind != Identifier) continue;
    const std::string_view name = WordText(first, last);
    if (option == UnitOption::Linear) SetUnit(name, kLinearUnits, &linearUnit);
    if (option == UnitOption::Angle) SetUnit(name, kAngleUnits, &angleUnit);
    if (option == UnitOption::Time) SetUnit(name, kTimeUnits, &timeUnit);
  }
}

}  // namespace mayaimport
