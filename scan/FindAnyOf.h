// Looks for the next of a few bytes, sixteen at a time on x86-64, eight elsewhere.
#pragma once

#include <bit>
#include <cstddef>
#include <cstdint>
#include <cstring>

#if defined(__SSE2__)
#include <emmintrin.h>
#endif

#include "scan/FindEnd.h"

namespace scan {

// The first of the bytes from `at` on, or `end`. The text may hold NULs and need not end with one: nothing
// from `end` on is read.
template <char... kWanted>
const char* FindAnyOf(const char* at, const char* end) {
#if defined(__SSE2__)
  constexpr std::ptrdiff_t kBlock = sizeof(__m128i);
  for (; end - at >= kBlock; at += kBlock) {
    const __m128i bytes = _mm_loadu_si128(reinterpret_cast<const __m128i*>(at));
    __m128i found = _mm_setzero_si128();
    ((found = _mm_or_si128(found, _mm_cmpeq_epi8(bytes, _mm_set1_epi8(kWanted)))), ...);
    const auto marks = static_cast<std::uint32_t>(_mm_movemask_epi8(found));
    if (marks != 0) return at + std::countr_zero(marks);
  }
#else
  if constexpr (std::endian::native == std::endian::little) {
    for (; end - at >= eight_bytes::kWordSize; at += eight_bytes::kWordSize) {
      std::uint64_t bytes = 0;
      std::memcpy(&bytes, at, sizeof bytes);
      const std::uint64_t marks = (eight_bytes::MarkEqual(bytes, kWanted) | ...);
      if (marks != 0) return at + std::countr_zero(marks) / 8;
    }
  }
#endif
  while (at != end && ((*at != kWanted) && ...)) ++at;
  return at;
}

}  // namespace scan
