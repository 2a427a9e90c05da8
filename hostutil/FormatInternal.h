// Patterns with the markers "^^1" and "^^2".
#pragma once

namespace hostutil {

// Walks the pattern once, from left to right: calls argument(0) or argument(1) for a marker and literal(text)
// for each other place, where text points at what is left of the pattern; it returns how many bytes it took.
// What an argument holds is never looked at.
template <typename Literal, typename Argument>
void WalkPattern(const char* pattern, Literal literal, Argument argument) {
  constexpr int kMarkerLength = 3;
  while (*pattern != '\0') {
    if (pattern[0] == '^' && pattern[1] == '^' && (pattern[2] == '1' || pattern[2] == '2')) {
      argument(pattern[2] - '1');
      pattern += kMarkerLength;
    } else {
      pattern += literal(pattern);
    }
  }
}

}  // namespace hostutil
