// The classification of 64 bytes with SSE2, which every x86-64 processor has, and with AVX2.
#include "scan/SkipTextX86.h"

#if defined(__x86_64__)

#include <immintrin.h>

#include "scan/SkipTextBlocks.h"

namespace scan {
namespace {

// ---- SSE2: ranges of bytes, sixteen at a time ----

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

BlockMasks ClassifySse2(const char* block) {
  BlockMasks masks{};
  for (int shift = 0; shift < kSkipBlock; shift += 16) {
    const __m128i bytes = _mm_loadu_si128(reinterpret_cast<const __m128i*>(block + shift));
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

// ---- AVX2: a table look-up by nibbles, 32 bytes at a time ----

// A byte belongs to a class where the entries of both its nibbles have the bit.
enum NibbleClass : unsigned {
  kLetters46 = 1,  // A to O and a to o, less c
  kLetters57 = 2,  // P to Z and p to z, less s
  kDigits = 4,
  kDot = 8,
  kDash = 16,
  kKeywordStart = 32,  // c, C, s, S
  kControl = 64,       // tab, line feed, carriage return
  kSemicolon = 128,
};

constexpr unsigned kLow[16] = {
    kLetters57 | kDigits,
    kLetters46 | kLetters57 | kDigits,
    kLetters46 | kLetters57 | kDigits,
    kKeywordStart | kDigits,
    kLetters46 | kLetters57 | kDigits,
    kLetters46 | kLetters57 | kDigits,
    kLetters46 | kLetters57 | kDigits,
    kLetters46 | kLetters57 | kDigits,
    kLetters46 | kLetters57 | kDigits,
    kLetters46 | kLetters57 | kDigits | kControl,
    kLetters46 | kLetters57 | kControl,
    kLetters46 | kSemicolon,
    kLetters46,
    kLetters46 | kDash | kControl,
    kLetters46 | kDot,
    kLetters46,
};

constexpr unsigned kHigh[16] = {kControl,
                                0,
                                kDot | kDash,
                                kDigits | kSemicolon,
                                kLetters46 | kKeywordStart,
                                kLetters57 | kKeywordStart,
                                kLetters46 | kKeywordStart,
                                kLetters57 | kKeywordStart};

struct NibbleTable {
  alignas(16) char entries[16];

  explicit constexpr NibbleTable(const unsigned (&classes)[16]) : entries() {
    for (int i = 0; i < 16; ++i) entries[i] = static_cast<char>(classes[i]);
  }
};

constexpr NibbleTable kLowTable(kLow);
constexpr NibbleTable kHighTable(kHigh);

constexpr unsigned kHarmless = kLetters46 | kLetters57 | kDigits | kDot;

#define TARGET_AVX2 [[gnu::target("avx2,bmi,popcnt")]]

TARGET_AVX2 inline __m256i TableOf(const NibbleTable& table) {
  return _mm256_broadcastsi128_si256(_mm_load_si128(reinterpret_cast<const __m128i*>(table.entries)));
}

TARGET_AVX2 inline std::uint32_t WithoutAny(__m256i classes, unsigned wanted) {
  const __m256i found = _mm256_and_si256(classes, _mm256_set1_epi8(static_cast<char>(wanted)));
  return static_cast<std::uint32_t>(_mm256_movemask_epi8(_mm256_cmpeq_epi8(found, _mm256_setzero_si256())));
}

TARGET_AVX2 inline std::uint32_t MaskOfEqual(__m256i bytes, char c) {
  return static_cast<std::uint32_t>(_mm256_movemask_epi8(_mm256_cmpeq_epi8(bytes, _mm256_set1_epi8(c))));
}

TARGET_AVX2 inline void ClassifyHalf(const char* at, int shift, BlockMasks* masks) {
  const __m256i bytes = _mm256_loadu_si256(reinterpret_cast<const __m256i*>(at));
  const __m256i highNibbles = _mm256_and_si256(_mm256_srli_epi16(bytes, 4), _mm256_set1_epi8(0x0f));
  // A byte of 128 and above looks up 0 among the low nibbles.
  const __m256i classes = _mm256_and_si256(_mm256_shuffle_epi8(TableOf(kLowTable), bytes),
                                           _mm256_shuffle_epi8(TableOf(kHighTable), highNibbles));
  const auto put = [shift](std::uint32_t bits) { return std::uint64_t{bits} << shift; };
  masks->terminator |= put(~WithoutAny(classes, kControl | kSemicolon) | MaskOfEqual(bytes, ' '));
  masks->semicolon |= put(MaskOfEqual(bytes, ';'));
  masks->lineFeed |= put(MaskOfEqual(bytes, '\n'));
  masks->harmless |= put(~WithoutAny(classes, kHarmless));
  masks->dash |= put(MaskOfEqual(bytes, '-'));
  masks->wordByte |= put(~WithoutAny(classes, kHarmless | kDash | kKeywordStart));
}

TARGET_AVX2 inline BlockMasks ClassifyAvx2(const char* block) {
  BlockMasks masks{};
  ClassifyHalf(block, 0, &masks);
  ClassifyHalf(block + 32, 32, &masks);
  return masks;
}

}  // namespace

const char* SkipBetweenCommandsSse2(const char* position, const char* end, std::int32_t* lines) {
  return SkipBlocks<SkipWhere::BetweenCommands>(position, end, lines, ClassifySse2);
}

const char* SkipInCommandSse2(const char* position, const char* end, std::int32_t* lines) {
  return SkipBlocks<SkipWhere::InCommand>(position, end, lines, ClassifySse2);
}

bool HasAvx2() {
  return __builtin_cpu_supports("avx2") && __builtin_cpu_supports("bmi") && __builtin_cpu_supports("popcnt");
}

TARGET_AVX2 const char* SkipBetweenCommandsAvx2(const char* position, const char* end, std::int32_t* lines) {
  return SkipBlocks<SkipWhere::BetweenCommands>(position, end, lines, ClassifyAvx2);
}

TARGET_AVX2 const char* SkipInCommandAvx2(const char* position, const char* end, std::int32_t* lines) {
  return SkipBlocks<SkipWhere::InCommand>(position, end, lines, ClassifyAvx2);
}

}  // namespace scan

#endif
