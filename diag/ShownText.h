// Text of a scene, made harmless for a terminal.
#pragma once

#include <string>
#include <string_view>

namespace diag {

// The bytes as text for a terminal: control characters, bytes that are no valid UTF-8, and invisible
// characters that change the order of what is shown are escaped (\n, \t, \x1b, \xff, \u202e). Everything else
// stays as it is, so the result is valid UTF-8 without a line end.
std::string ShownText(std::string_view bytes);

}  // namespace diag
