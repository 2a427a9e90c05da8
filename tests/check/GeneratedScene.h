// Well-formed scenes from a number.
#pragma once

#include <cstdint>
#include <string>

namespace check_test {

// A few cameras under chains of transforms, with curves of equal or unequal key counts, constraints, blends,
// look-ats in long and short names, and lenses that other nodes drive. The same number gives the same scene.
std::string GeneratedScene(std::uint64_t seed);

}  // namespace check_test
