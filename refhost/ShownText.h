// Text for output: bytes that others wrote become valid UTF-8, and JSON strings.
#pragma once

#include <string>
#include <string_view>

#include "hostapi/HostTypes.h"

namespace refhost {

// The bytes with each one that is not part of valid UTF-8 replaced by U+FFFD.
std::string shownText(std::string_view bytes);

// NUL-terminated units as UTF-8, each lone surrogate replaced by U+FFFD. Not for null.
std::string shownUnits(const HostUTF16Unit* units);

// Appends the bytes as a JSON string with its quotes: invalid UTF-8 as in shownText, quotes and backslashes
// escaped, control characters (those from U+007F to U+009F too) as \u00xx.
void appendJsonText(std::string& line, std::string_view bytes);

}  // namespace refhost
