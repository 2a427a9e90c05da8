// Numbers in sentences.
#pragma once

#include <string>

namespace check {

// At most three decimals, no trailing zeros; the same in every locale.
std::string NumberText(double number);

}  // namespace check
