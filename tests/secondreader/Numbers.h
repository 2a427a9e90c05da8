// Numbers as the importer's rules have them, worked out slowly.
#pragma once

#include <cstdint>
#include <string_view>

#include "hostapi/HostTypes.h"

namespace secondreader {

// Reads a whole text as one number: a sign or none, decimal digits with a point among them or none, an
// exponent or none, and after that letters only, which do not count. The double is the nearest one, of two
// equally near the even one. HOST_ERR_NUMBER_SYNTAX where this does not fit, HOST_ERR_NUMBER_RANGE beyond the
// largest double; *value then stays as it is.
HostError readNumber(std::string_view text, double* value);

// -1, 0 or 1 as the first ratio is smaller, equal or greater. The denominators are not 0.
int compareRatios(const HostRatio& a, const HostRatio& b);

// The part before the point, clamped to the range of the type; 0 for NaN.
std::int32_t wholePart(double value);
std::uint32_t wholePartUnsigned(double value);

}  // namespace secondreader
