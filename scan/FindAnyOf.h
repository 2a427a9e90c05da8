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

#if defined(__SSE2__)
namespace sixteen_bytes {

inline constexpr std::ptrdiff_t kSize = sizeof(__m128i);

// A bit for each of the bytes at `at` that is one of those wanted, the first byte in the lowest bit.
template <char... kWanted>
[[gnu::always_inline]] inline std::uint64_t Mark(const char* at) {
  const __m128i bytes = _mm_loadu_si128(reinterpret_cast<const __m128i*>(at));
  __m128i found = _mm_setzero_si128();
  ((found = _mm_or_si128(found, _mm_cmpeq_epi8(bytes, _mm_set1_epi8(kWanted)))), ...);
  return static_cast<std::uint32_t>(_mm_movemask_epi8(found));
}

}  // namespace sixteen_bytes
#endif

// The first of the bytes from `at` on, or `end`. The text may hold NULs and need not end with one: nothing
// from `end` on is read.
template <char... kWanted>
const char* FindAnyOf(const char* at, const char* end) {
#if defined(__SSE2__)
  for (; end - at >= sixteen_bytes::kSize; at += sixteen_bytes::kSize) {
    const std::uint64_t marks = sixteen_bytes::Mark<kWanted...>(at);
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

// The same where most of those found are passed over: the first that `stops(const char*)` is true for, or
// `end`.
template <char... kWanted, typename Stops>
const char* FindAnyOf(const char* at, const char* end, Stops stops) {
#if defined(__SSE2__)
  constexpr std::ptrdiff_t kBlock = 4 * sixteen_bytes::kSize;
  for (; end - at >= kBlock; at += kBlock) {
    std::uint64_t marks = 0;
    for (std::ptrdiff_t part = 0; part < kBlock; part += sixteen_bytes::kSize)
      marks |= sixteen_bytes::Mark<kWanted...>(at + part) << part;
    for (; marks != 0; marks &= marks - 1) {
      const char* const found = at + std::countr_zero(marks);
      if (stops(found)) return found;
    }
  }
#endif
  for (;; ++at) {
    at = FindAnyOf<kWanted...>(at, end);
    if (at == end || stops(at)) return at;
  }
}

}  // namespace scan
