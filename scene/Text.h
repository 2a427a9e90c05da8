// Escapes in strings.
#pragma once

#include <string>
#include <string_view>

namespace scene {

// The string with its escapes read, from what stands between its quotes: \n, \t, \r, \b and \f become the
// characters that they name; a backslash before any other byte is removed. A backslash at the very end stays.
std::string Unescaped(std::string_view text);

}  // namespace scene
