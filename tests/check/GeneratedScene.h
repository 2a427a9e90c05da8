// Well-formed scenes from a number.
#pragma once

#include <cstdint>
#include <string>

namespace check_test {

// A few cameras and locators under chains of transforms, in any unit, with curves of equal or unequal key
// counts, constraints, blends, look-ats in long and short names, lenses that curves drive, nodes that the
// importer does not find, and all that a transform can hold. The same number gives the same scene.
std::string GeneratedScene(std::uint64_t seed);

}  // namespace check_test
