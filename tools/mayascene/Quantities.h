// Numbers, times and ratios as a person reads them. Nothing here looks at the locale.
#pragma once

#include <cstddef>
#include <string>

#include "hostapi/HostTypes.h"
#include "refhost/Project.h"

namespace mayascene {

// At most three decimals, no trailing zeros: "2057.386", "-12.5", "0". A smaller value that is more than
// rounding noise keeps three digits: "0.00012".
std::string numberText(double value);

// "1 key", "12 keys"
std::string countText(std::size_t count, const std::string& thing);

// The quotient as a number; "24/0" where there is none.
std::string ratioText(const HostRatio& ratio);

// "5 s (120 frames)"; the time alone where the rate gives no frames.
std::string durationText(const T_Time& duration, const HostRatio& rate);

// "120 keys, frames 0 to 119 (0 s to 4.958 s)", "1 key, frame 0 (0 s)"; with ", constant" after it where
// several keys have one value. The stream has keys.
std::string keysText(const refhost::Stream& stream, const HostRatio& rate);

// "frames 0 to 119", "frame 0"; seconds where the rate gives no frames.
std::string spanText(const T_Time& first, const T_Time& last, const HostRatio& rate);

bool isEarlier(const T_Time& one, const T_Time& other);

// Whether the stream has one value at all times, but for rounding noise: by no key, by one, or by several.
bool isStill(const refhost::Stream& stream);

// "12, -3.5, 0"
std::string valueText(const refhost::Stream& stream);

}  // namespace mayascene
