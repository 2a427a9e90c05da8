// Names of the nodes of a baked scene.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <unordered_map>
#include <unordered_set>

namespace bake {

// Gives each node a unique name, without regard to case: the wanted one where it is free, else with _2, _3 …
// at its end. A name has at most 200 bytes, and is never perspShape, which the importer drops.
class UniqueNames {
 public:
  static constexpr std::size_t kLongest = 200;

  UniqueNames();

  // Bytes of `wanted` that a name cannot have become "_". An empty name becomes "node".
  std::string Take(std::string_view wanted);

 private:
  std::unordered_set<std::string> taken_;  // in lower case
  std::unordered_map<std::string, std::uint64_t>
      next_;  // by the name's beginning in lower case: the number to try
};

}  // namespace bake
