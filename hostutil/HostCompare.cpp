#include "hostutil/HostCompare.h"

#include <cstdint>

std::int32_t HostCompareNoCase(const char* a, const char* b) {
  if (a == nullptr) a = "";
  if (b == nullptr) b = "";
  for (;; ++a, ++b) {
    const unsigned char foldedA = FoldCase(static_cast<unsigned char>(*a));
    const unsigned char foldedB = FoldCase(static_cast<unsigned char>(*b));
    if (foldedA != foldedB) return foldedA < foldedB ? -1 : 1;
    if (foldedA == '\0') return 0;
  }
}
