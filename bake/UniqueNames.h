// Names of the nodes of a baked scene.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <unordered_map>
#include <unordered_set>

namespace bake {

// Gives each node a name of its own, without regard to case: the one that it has where that is free, else
// with _2, _3 … at its end. A name has at most 200 bytes and never one that the importer gives a meaning of
// its own.
class UniqueNames {
 public:
  static constexpr std::size_t kLongest = 200;

  UniqueNames();

  // What of `wanted` cannot stand in a name of a scene becomes "_".
  std::string Take(std::string_view wanted);

 private:
  std::unordered_set<std::string> taken_;  // in lower case
  std::unordered_map<std::string, std::uint64_t>
      next_;  // by the name's beginning in lower case: the number to try
};

}  // namespace bake
