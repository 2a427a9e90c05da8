// How much room a text takes on a terminal.
#pragma once

#include <cstddef>
#include <string_view>

namespace diag {

// The columns that an escaped text takes in a font of one width: two for each wide character of East Asia and
// each emoji, none for a mark that stands over another character, one for every other one.
std::size_t ColumnsOf(std::string_view shown);

}  // namespace diag
