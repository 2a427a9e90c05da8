// Texts compared without regard to case; only A to Z are folded.
#pragma once

#include <cstddef>
#include <string_view>

#include "hostutil/HostCompare.h"

inline bool SameWord(std::string_view a, std::string_view b) {
  if (a.size() != b.size()) return false;
  if (a == b) return true;  // as a rule the case agrees too
  for (std::size_t i = 0; i < a.size(); ++i) {
    if (FoldCase(static_cast<unsigned char>(a[i])) != FoldCase(static_cast<unsigned char>(b[i])))
      return false;
  }
  return true;
}

// Whether the word is one of the list.
template <typename List>
bool IsOneOf(std::string_view word, const List& list) {
  for (const std::string_view candidate : list) {
    if (SameWord(word, candidate)) return true;
  }
  return false;
}
