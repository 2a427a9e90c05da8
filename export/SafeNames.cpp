#include "export/SafeNames.h"

#include <algorithm>
#include <array>

namespace interchange {
namespace {

bool IsSafe(char c) {
  return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9') || c == '-' || c == '_' ||
         c == '.';
}

// Some systems take these for devices, with a suffix too.
bool IsDevice(std::string_view name) {
  constexpr std::array<std::string_view, 4> kDevices = {"con", "prn", "aux", "nul"};
  const std::string first = Lowered(name.substr(0, name.find('.')));
  if (std::find(kDevices.begin(), kDevices.end(), first) != kDevices.end()) return true;
  return first.size() == 4 && (first.starts_with("com") || first.starts_with("lpt")) && first[3] >= '0' &&
         first[3] <= '9';
}

}  // namespace

std::string Lowered(std::string_view text) {
  std::string lowered(text);
  for (char& c : lowered) {
    if (c >= 'A' && c <= 'Z') c = static_cast<char>(c - 'A' + 'a');
  }
  return lowered;
}

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
  const auto [own, isFree] = taken_.try_emplace(Lowered(name), 1);
  if (isFree) return std::string(name);
  std::string free;
  // Of many of one name each begins where the one before ended.
  do {
    free = std::string(name) + '_' + std::to_string(++own->second);
  } while (!taken_.try_emplace(Lowered(free), 1).second);
  return free;
}

}  // namespace interchange
