// The digits of an integer times a power of two, all of them.
#pragma once

#include <cstdint>
#include <string>

namespace scan_tests {

// significand * 2^exponent without an exponent, such as "0.375"; for exponents of doubles, down to -1075.
std::string ExactDecimal(std::uint64_t significand, int exponent);

}  // namespace scan_tests
