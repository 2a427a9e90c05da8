// Names of files, from names of layers: without folders, without signs that have a meaning for a system or a
// shell, and each name once.
#pragma once

#include <cstddef>
#include <map>
#include <string>
#include <string_view>

namespace interchange {

// The longest safe name, in bytes.
inline constexpr std::size_t kLongestSafeName = 120;

// Keeps letters, digits, "-", "_" and "." of the name; every other byte becomes "_". The result is never
// empty, has no dot or dash in front and no dot at the end, and is never a device's name. `otherwise` where
// nothing is left of the name.
std::string SafeName(std::string_view name, std::string_view otherwise);

// Names of which no two are the same, without regard to case.
class UniqueNames {
 public:
  // The name, with _2, _3 … after it where it is taken.
  std::string Take(std::string_view name);

 private:
  std::map<std::string, std::size_t> taken_;  // in lower case, with the last number that was tried
};

}  // namespace interchange
