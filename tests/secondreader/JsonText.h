// How the trace writes texts that may hold any bytes.
#pragma once

#include <string>
#include <string_view>

namespace secondreader {

// The bytes as a JSON string with its quotes: each byte that is not part of valid UTF-8 as U+FFFD, quotes and
// backslashes after a backslash, the control characters U+0000 to U+001F and U+007F to U+009F as \u00xx.
std::string jsonText(std::string_view bytes);

}  // namespace secondreader
