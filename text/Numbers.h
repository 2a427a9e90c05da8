// Numbers as text, the same in every locale.
#pragma once

#include <string>

namespace text {

// The shortest digits that give the same bits.
std::string ShortestNumber(double number);

// For sentences: at most three decimals, no trailing zeros. From 1e15 on, and for what is not finite, as
// ShortestNumber.
std::string RoundedNumber(double number);

}  // namespace text
