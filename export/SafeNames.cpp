#include "export/SafeNames.h"

#include <algorithm>
#include <array>

#include "text/Letters.h"

namespace interchange {
namespace {

bool IsSafe(char c) {
  return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9') || c == '-' || c == '_' ||
         c == '.';
}

// Some systems take these names for devices, also with a suffix.
bool IsDevice(std::string_view name) {
  constexpr std::array<std::string_view, 4> kDevices = {"con", "prn", "aux", "nul"};
  const std::string first = text::Lowered(name.substr(0, name.find('.')));
  if (std::find(kDevices.begin(), kDevices.end(), first) != kDevices.end()) return true;
  return first.size() == 4 && (first.starts_with("com") || first.starts_with("lpt")) && first[3] >= '0' &&
         first[3] <= '9';
}

}  // namespace

std::string SafeName(std::string_view name, std::string_view otherwise) {
  std::string safe(name.substr(0, kLongestSafeName));
  std::replace_if(
      safe.begin(), safe.end(), [](char c) { return !IsSafe(c); }, '_');
  safe.erase(0, safe.find_first_not_of(".-"));
  safe.erase(safe.find_last_not_of('.') + 1);
  if (safe.empty()) return std::string(otherwise);
  if (IsDevice(safe)) safe.insert(0, 1, '_');
  return safe;
}

std::string UniqueNames::Take(std::string_view name) {
  const auto [own, isFree] = taken_.try_emplace(text::Lowered(name), 1);
  if (isFree) return std::string(name);
  std::string free;
  // Of many equal names each continues with the number after the last one.
  do {
    free = std::string(name) + '_' + std::to_string(++own->second);
  } while (!taken_.try_emplace(text::Lowered(free), 1).second);
  return free;
}

}  // namespace interchange
