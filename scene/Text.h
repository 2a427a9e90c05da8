// The text of values and names.
#pragma once

#include <string>
#include <string_view>

namespace scene {

// A string as it is meant, from what stands between its quotes: \n, \t, \r, \b and \f are the characters that
// they name; a backslash before any other byte goes away. A backslash at the very end stays.
std::string Unescaped(std::string_view text);

}  // namespace scene
