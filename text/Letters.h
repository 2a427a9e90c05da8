// ASCII letters in text of any encoding, the same in every locale.
#pragma once

#include <string>
#include <string_view>

namespace text {

// The bytes with A to Z in lower case. All others stay.
std::string Lowered(std::string_view bytes);

}  // namespace text
