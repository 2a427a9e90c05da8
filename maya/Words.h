// Texts compared without regard to case; only A to Z are folded.
#pragma once

#include <algorithm>
#include <cstddef>
#include <string_view>

#include "hostutil/HostCompare.h"

namespace mayaimport {

inline bool SameLetter(char a, char b) {
  return FoldCase(static_cast<unsigned char>(a)) == FoldCase(static_cast<unsigned char>(b));
}

inline bool SameWord(std::string_view a, std::string_view b) {
  if (a.size() != b.size()) return false;
  if (a.empty()) return true;
  if (!SameLetter(a.back(), b.back())) return false;  // the names of attributes differ at their ends
  if (a == b) return true;                            // as a rule the case agrees too
  return std::equal(a.begin(), a.end(), b.begin(), SameLetter);
}

// Whether the word is one of the list.
template <typename List>
bool IsOneOf(std::string_view word, const List& list) {
  for (const std::string_view candidate : list) {
    if (SameWord(word, candidate)) return true;
  }
  return false;
}

}  // namespace mayaimport
