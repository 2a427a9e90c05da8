// Patterns with the markers "^^1" and "^^2".
#pragma once

namespace hostutil {

// Walks the pattern once, from left to right. Calls argument(0) or argument(1) for a marker. For anything
// else it calls literal(text) with what is left of the pattern; that returns how many bytes it took, 1 or
// more. Markers inside an argument are not replaced.
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
