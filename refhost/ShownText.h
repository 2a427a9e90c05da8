// Text for output: bytes and units that others wrote become valid UTF-8.
#pragma once

#include <string>
#include <string_view>

#include "hostapi/HostTypes.h"

namespace refhost {

// The bytes with each one that is not part of valid UTF-8 replaced by U+FFFD.
std::string shownText(std::string_view bytes);

// NUL-terminated units as UTF-8, each lone surrogate replaced by U+FFFD. Not for null.
std::string shownUnits(const HostUTF16Unit* units);

}  // namespace refhost
