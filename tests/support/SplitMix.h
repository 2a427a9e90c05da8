// Chance that is the same on every platform for the same seed.
#pragma once

#include <cstdint>

namespace testsupport {

// The next 64 bits of SplitMix64.
inline std::uint64_t SplitMix(std::uint64_t* state) {
  *state += 0x9e3779b97f4a7c15u;
  std::uint64_t mixed = *state;
  mixed = (mixed ^ (mixed >> 30)) * 0xbf58476d1ce4e5b9u;
  mixed = (mixed ^ (mixed >> 27)) * 0x94d049bb133111ebu;
  return mixed ^ (mixed >> 31);
}

}  // namespace testsupport
