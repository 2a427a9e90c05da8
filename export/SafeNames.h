// Names of layers made into names of files: no folder, nothing that a system or a shell takes for something
// else, no name twice.
#pragma once

#include <cstddef>
#include <map>
#include <string>
#include <string_view>

namespace interchange {

// The longest safe name, in bytes.
inline constexpr std::size_t kLongestSafeName = 120;

// Letters, digits, "-", "_" and "." of the name, everything else "_"; never empty, never with a dot or a dash
// in front or a dot at the end, never a device's name; `otherwise` where nothing is left of it.
std::string SafeName(std::string_view name, std::string_view otherwise);

// Lower case of ASCII letters.
std::string Lowered(std::string_view text);

// Names of which no two are the same, without regard to case.
class UniqueNames {
 public:
  // The name, or with _2, _3 … after it where it is taken.
  std::string Take(std::string_view name);

 private:
  std::map<std::string, std::size_t> taken_;  // lowered, and the number that it got last
};

}  // namespace interchange
