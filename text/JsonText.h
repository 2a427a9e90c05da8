// A text as JSON has it: in quotes, with escapes.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>

namespace text {

enum class JsonForm : std::uint8_t {
  Ascii,  // ASCII only, all else as \uXXXX: so a name cannot control a terminal that shows the JSON
  Utf8,   // UTF-8 as it is; control characters, those from U+007F to U+009F too, as \u00xx
};

// Appends the bytes as a JSON string with its quotes. Each byte that is not part of valid UTF-8 becomes
// U+FFFD.
void AppendJsonText(std::string* out, std::string_view bytes, JsonForm form);

}  // namespace text
