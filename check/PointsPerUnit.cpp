#include "check/PointsPerUnit.h"

#include <array>

#include "check/Cameras.h"

namespace check {

double PointsPerUnit(std::string_view word) {
  struct Row {
    std::string_view shortName, longName;
    double points;
  };
  // Deliberate: metres and kilometres do not fit the rest. The importer converts them so.
  constexpr std::array kRows = {
      Row{"mm", "millimeter", 72.0 / 25.4},    Row{"m", "meter", 100.0 / 0.0254 * 72.0},
      Row{"km", "kilometer", 1000.0 * 7200.0}, Row{"in", "inch", 72.0},
      Row{"ft", "foot", 12.0 * 72.0},          Row{"yd", "yard", 36.0 * 72.0},
      Row{"mi", "mile", 5280.0 * 12.0 * 72.0}};
  for (const Row& row : kRows) {
    if (SameName(word, row.shortName) || SameName(word, row.longName)) return row.points;
  }
  return 72.0 / 2.54;
}

}  // namespace check
