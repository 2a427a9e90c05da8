// Blocks of 64 bytes with SSE2, which every x86-64 processor has: ranges of bytes, sixteen at a time.
#include "scan/SkipTextX86.h"

#if defined(__x86_64__)

#include <emmintrin.h>

#include <algorithm>

#include "scan/SkipTextBlocks.h"

namespace scan {
namespace {

// 0xff for every byte from `first` on, `count` of them.
__m128i InRange(__m128i bytes, char first, char count) {
  const __m128i offset = _mm_sub_epi8(bytes, _mm_set1_epi8(first));
  return _mm_cmpeq_epi8(_mm_min_epu8(offset, _mm_set1_epi8(static_cast<char>(count - 1))), offset);
}

__m128i Equal(__m128i bytes, char c) { return _mm_cmpeq_epi8(bytes, _mm_set1_epi8(c)); }

__m128i Either(__m128i a, __m128i b) { return _mm_or_si128(a, b); }

std::uint64_t MaskOf(__m128i bytes, int shift) {
  return std::uint64_t{static_cast<std::uint32_t>(_mm_movemask_epi8(bytes))} << shift;
}

__m128i Load(const char* at) { return _mm_loadu_si128(reinterpret_cast<const __m128i*>(at)); }

struct Sse2 {
  static BlockMasks Classify(const char* block);
  template <SkipWhere kWhere>
  static const char* SkipWithoutStops(const char* block, const char* end, std::int32_t* lines);
};

BlockMasks Sse2::Classify(const char* block) {
  BlockMasks masks{};
  for (int shift = 0; shift < kSkipBlock; shift += 16) {
    const __m128i bytes = Load(block + shift);
    const __m128i lower = Either(bytes, _mm_set1_epi8(0x20));
    const __m128i lineFeed = Equal(bytes, '\n');
    const __m128i space =
        Either(Either(Equal(bytes, ' '), Equal(bytes, '\t')), Either(lineFeed, Equal(bytes, '\r')));
    const __m128i letter = InRange(lower, 'a', 26);
    const __m128i keywordStart = Either(Equal(lower, 'c'), Equal(lower, 's'));
    const __m128i numeral = Either(InRange(bytes, '0', 10), Equal(bytes, '.'));
    const __m128i dash = Equal(bytes, '-');
    const __m128i semicolon = Equal(bytes, ';');
    masks.terminator |= MaskOf(Either(space, semicolon), shift);
    masks.semicolon |= MaskOf(semicolon, shift);
    masks.lineFeed |= MaskOf(lineFeed, shift);
    masks.harmless |= MaskOf(Either(_mm_andnot_si128(keywordStart, letter), numeral), shift);
    masks.dash |= MaskOf(dash, shift);
    masks.wordByte |= MaskOf(Either(Either(letter, numeral), dash), shift);
  }
  return masks;
}

// A byte that may stop has its highest bit set.
template <SkipWhere kWhere>
__m128i MayStop(const char* at, __m128i bytes, __m128i lineFeed) {
  const __m128i before = Load(at - 1);
  // Vertical tab and form feed are among them, though no word starts after those. The masks sort that out.
  const __m128i control = InRange(before, '\t', '\r' - '\t' + 1);
  const __m128i afterEnd = Either(control, Either(Equal(before, ' '), Equal(before, ';')));
  const __m128i semicolon = Equal(bytes, ';');
  const __m128i space =
      Either(Either(Equal(bytes, ' '), Equal(bytes, '\t')), Either(lineFeed, Equal(bytes, '\r')));
  const __m128i letter = InRange(Either(bytes, _mm_set1_epi8(0x20)), 'a', 26);
  // Setting the bits of 0x30 makes "s" of c, s, C and S, and of no other byte.
  const __m128i keywordStart = Equal(Either(bytes, _mm_set1_epi8(0x30)), 's');
  const __m128i word = _mm_andnot_si128(keywordStart, letter);
  if constexpr (kWhere == SkipWhere::InCommand) {
    const __m128i numeral = Either(InRange(bytes, '0', 10), Equal(bytes, '.'));
    return Either(semicolon, _mm_andnot_si128(Either(space, Either(word, numeral)), afterEnd));
  } else {
    const __m128i numeral = _mm_andnot_si128(Equal(bytes, '/'), InRange(bytes, '-', '9' - '-' + 1));
    const __m128i harmless = Either(Either(space, semicolon), Either(word, numeral));
    return Either(_mm_andnot_si128(harmless, afterEnd), _mm_andnot_si128(numeral, Equal(before, '-')));
  }
}

template <SkipWhere kWhere>
[[gnu::noinline]] const char* Sse2::SkipWithoutStops(const char* block, const char* end,
                                                     std::int32_t* lines) {
  constexpr std::ptrdiff_t kMostBlocks = 255 / 4;  // each adds up to 4 to a counter
  for (;;) {
    const char* const last = block + std::min((end - block) / kSkipBlock, kMostBlocks) * kSkipBlock;
    const char* at = block;
    __m128i counters = _mm_setzero_si128();
    for (; at != last; at += kSkipBlock) {
      __m128i stops = _mm_setzero_si128();
      __m128i counted = counters;
      for (int quarter = 0; quarter < kSkipBlock; quarter += 16) {
        const __m128i bytes = Load(at + quarter);
        const __m128i lineFeed = Equal(bytes, '\n');
        stops = Either(stops, MayStop<kWhere>(at + quarter, bytes, lineFeed));
        counted = _mm_sub_epi8(counted, lineFeed);
      }
      if (_mm_movemask_epi8(stops) != 0) break;
      counters = counted;
    }
    const __m128i sums = _mm_sad_epu8(counters, _mm_setzero_si128());
    *lines += _mm_cvtsi128_si32(sums) + _mm_extract_epi16(sums, 4);
    if (at != last || last == block) return at;
    block = at;
  }
}

}  // namespace

const char* SkipBetweenCommandsSse2(const char* position, const char* end, std::int32_t* lines) {
  return SkipBlocks<SkipWhere::BetweenCommands, Sse2>(position, end, lines);
}

const char* SkipInCommandSse2(const char* position, const char* end, std::int32_t* lines) {
  return SkipBlocks<SkipWhere::InCommand, Sse2>(position, end, lines);
}

}  // namespace scan

#endif
