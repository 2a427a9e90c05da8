#include "bench/WordCount.h"

#include <array>

#if defined(__x86_64__)
#include <immintrin.h>

#include <bit>
#include <cstdint>
#endif

namespace bench {
namespace {

bool isSpace(char c) { return c == ' ' || (c >= '\t' && c <= '\r'); }

// Counts the rest of a text; the flag says whether the byte before `text` is white space.
std::size_t countRest(const char* text, const char* end, bool afterSpace) {
  std::size_t words = 0;
  for (; text != end; ++text) {
    const bool space = isSpace(*text);
    words += afterSpace && !space ? 1 : 0;
    afterSpace = space;
  }
  return words;
}

std::size_t countPlain(const char* text, std::size_t size) { return countRest(text, text + size, true); }

#if defined(__x86_64__)

constexpr std::size_t kBlock = 64;

// 64 bytes at a time: `spacesOf` gives a bit for each that is white space. A word starts at a byte that is
// none and comes after one, or at the text's first byte.
template <typename SpacesOf>
[[gnu::always_inline]] inline std::size_t countBlocks(const char* text, std::size_t size, SpacesOf spacesOf) {
  std::size_t words = 0;
  std::uint64_t afterSpace = 1;
  const char* const end = text + size;
  for (; static_cast<std::size_t>(end - text) >= kBlock; text += kBlock) {
    const std::uint64_t spaces = spacesOf(text);
    words += static_cast<std::size_t>(std::popcount((spaces << 1 | afterSpace) & ~spaces));
    afterSpace = spaces >> (kBlock - 1);
  }
  return words + countRest(text, end, afterSpace != 0);
}

std::uint64_t spacesSse2(const char* block) {
  std::uint64_t spaces = 0;
  for (int at = 0; at < static_cast<int>(kBlock); at += 16) {
    const __m128i bytes = _mm_loadu_si128(reinterpret_cast<const __m128i*>(block + at));
    const __m128i fromTab = _mm_sub_epi8(bytes, _mm_set1_epi8('\t'));
    const __m128i control = _mm_cmpeq_epi8(_mm_min_epu8(fromTab, _mm_set1_epi8('\r' - '\t')), fromTab);
    const __m128i space = _mm_or_si128(control, _mm_cmpeq_epi8(bytes, _mm_set1_epi8(' ')));
    spaces |= std::uint64_t{static_cast<std::uint32_t>(_mm_movemask_epi8(space))} << at;
  }
  return spaces;
}

std::size_t countSse2(const char* text, std::size_t size) { return countBlocks(text, size, spacesSse2); }

#define TARGET_AVX2 [[gnu::target("avx2,popcnt")]]

TARGET_AVX2 inline std::uint32_t spacesOfHalf(const char* half) {
  const __m256i bytes = _mm256_loadu_si256(reinterpret_cast<const __m256i*>(half));
  const __m256i fromTab = _mm256_sub_epi8(bytes, _mm256_set1_epi8('\t'));
  const __m256i control = _mm256_cmpeq_epi8(_mm256_min_epu8(fromTab, _mm256_set1_epi8('\r' - '\t')), fromTab);
  const __m256i space = _mm256_or_si256(control, _mm256_cmpeq_epi8(bytes, _mm256_set1_epi8(' ')));
  return static_cast<std::uint32_t>(_mm256_movemask_epi8(space));
}

TARGET_AVX2 inline std::uint64_t spacesAvx2(const char* block) {
  return spacesOfHalf(block) | std::uint64_t{spacesOfHalf(block + 32)} << 32;
}

TARGET_AVX2 std::size_t countAvx2(const char* text, std::size_t size) {
  return countBlocks(text, size, spacesAvx2);
}

#endif

}  // namespace

std::span<const WordCounter> wordCounters() {
#if defined(__x86_64__)
  static constexpr std::array<WordCounter, 3> kCounters = {
      {{"plain", countPlain}, {"SSE2", countSse2}, {"AVX2", countAvx2}}};
  const bool hasAvx2 = __builtin_cpu_supports("avx2") && __builtin_cpu_supports("popcnt");
  return std::span(kCounters).first(hasAvx2 ? 3 : 2);
#else
  static constexpr std::array<WordCounter, 1> kCounters = {{{"plain", countPlain}}};
  return kCounters;
#endif
}

std::size_t countWords(const char* text, std::size_t size) { return wordCounters().back().count(text, size); }

}  // namespace bench
