// Sentences with places for arguments.
#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace diag {

// The text with the arguments in the places of {0}, {1} …, harmless on a terminal. Arguments may hold any
// bytes; the text has no other braces, and no place without an argument.
std::string Fill(std::string_view text, const std::vector<std::string>& arguments);

}  // namespace diag
