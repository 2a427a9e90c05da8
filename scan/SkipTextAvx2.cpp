// Blocks of 64 bytes with AVX2: a table look-up by nibbles, 32 bytes at a time.
#include "scan/SkipTextX86.h"

#if defined(__x86_64__)

#include <immintrin.h>

#include <algorithm>
#include <string_view>

#include "scan/SkipTextBlocks.h"

namespace scan {
namespace {

// ---- The tables ----

// The bytes whose high and low nibbles are among these hexadecimal digits have this bit.
struct Rectangle {
  unsigned bit;
  std::string_view high;
  std::string_view low;
};

// A byte has the bits that the entries of both its nibbles have.
struct NibbleTables {
  alignas(16) std::uint8_t low[16];
  alignas(16) std::uint8_t high[16];

  template <std::size_t kCount>
  explicit constexpr NibbleTables(const Rectangle (&rectangles)[kCount]) : low(), high() {
    for (const Rectangle& rectangle : rectangles) {
      for (const char digit : rectangle.low) Add(rectangle.bit, &low[NibbleOf(digit)]);
      for (const char digit : rectangle.high) Add(rectangle.bit, &high[NibbleOf(digit)]);
    }
  }

  // What the look-up in vector registers gives: nothing for a byte of 128 and above.
  constexpr unsigned BitsOf(unsigned byte) const {
    if (byte >= 128) return 0;
    return static_cast<unsigned>(low[byte % 16] & high[byte / 16]);
  }

 private:
  static constexpr unsigned NibbleOf(char digit) {
    return static_cast<unsigned>(digit <= '9' ? digit - '0' : digit - 'a' + 10);
  }
  static constexpr void Add(unsigned bit, std::uint8_t* entry) {
    *entry = static_cast<std::uint8_t>(*entry | bit);
  }
};

constexpr std::string_view kLettersLessC = "12456789abcdef";  // from A, a to O, o
constexpr std::string_view kLettersLessS = "012456789a";      // from P, p to Z, z
constexpr std::string_view kDigits = "0123456789";
constexpr std::string_view kControls = "9ad";  // tab, line feed, carriage return

// The classes that the masks are made of. Semicolons and blanks have comparisons of their own.
enum MaskClass : unsigned {
  kHarmlessLetters46 = 1,
  kHarmlessLetters57 = 2,
  kControl = 4,
  kDot = 8,
  kDash = 16,
  kKeywordLetter = 32,
  kNumeral = 64,
};
constexpr unsigned kHarmless = kHarmlessLetters46 | kHarmlessLetters57 | kNumeral | kDot;
constexpr NibbleTables kMaskTables({{kHarmlessLetters46, "46", kLettersLessC},
                                    {kHarmlessLetters57, "57", kLettersLessS},
                                    {kControl, "0", kControls},
                                    {kDot, "2", "e"},
                                    {kDash, "2", "d"},
                                    {kKeywordLetter, "4567", "3"},
                                    {kNumeral, "3", kDigits}});

// The bytes at which nothing stops after the end of a word have a bit, no matter which. The highest bit says
// more: between commands it marks the digits, which may come after "-".
constexpr unsigned kHighest = 128;
constexpr NibbleTables kBetweenTables({{1, "46", kLettersLessC},
                                       {2, "57", kLettersLessS},
                                       {4, "0", kControls},
                                       {8, "2", "0"},
                                       {16, "2", "de"},
                                       {32, "3", "b"},
                                       {kHighest, "3", kDigits}});

// In a command the highest bit marks ";", which stops wherever it stands.
constexpr NibbleTables kInCommandTables({{1, "46", kLettersLessC},
                                         {2, "57", kLettersLessS},
                                         {4, "0", kControls},
                                         {8, "2", "0"},
                                         {16, "2", "e"},
                                         {32, "3", kDigits},
                                         {kHighest, "3", "b"}});

// Whether the tables agree with kByteClasses.
constexpr bool TablesAgree() {
  for (unsigned byte = 0; byte < 256; ++byte) {
    const char c = static_cast<char>(byte);
    const bool harmless = (IsLetter(c) && !IsAny(c, kKeywordStart)) || IsDigit(c) || c == '.';
    const unsigned bits = kMaskTables.BitsOf(byte);
    const unsigned between = kBetweenTables.BitsOf(byte);
    const unsigned inCommand = kInCommandTables.BitsOf(byte);
    if (((bits & kHarmless) != 0) != harmless) return false;
    if (((bits & kControl) != 0) != (IsWhiteSpace(c) && c != ' ')) return false;
    if (((bits & (kHarmless | kDash | kKeywordLetter)) != 0) != IsWordByte(c)) return false;
    if ((between != 0) != (harmless || IsWordEnd(c) || c == '-')) return false;
    if (((between & kHighest) != 0) != IsDigit(c)) return false;
    if ((inCommand != 0) != (harmless || IsWordEnd(c))) return false;
    if (((inCommand & kHighest) != 0) != (c == ';')) return false;
  }
  return true;
}
static_assert(TablesAgree());

// The bytes that end a word, each at the index of its low nibble: a byte ends a word when the entry at its
// low nibble equals it. Entry 0 is a blank; the zeros equal no byte that looks them up.
alignas(16) constexpr char kWordEnds[16] = {' ', 0, 0, 0, 0, 0, 0, 0, 0, '\t', '\n', ';', 0, '\r', 0, 0};

// ---- The processor ----

#define TARGET_AVX2 [[gnu::target("avx2,bmi,popcnt")]]

TARGET_AVX2 inline __m256i Load(const char* at) {
  return _mm256_loadu_si256(reinterpret_cast<const __m256i*>(at));
}

TARGET_AVX2 inline __m256i TableOf(const void* entries) {
  return _mm256_broadcastsi128_si256(_mm_load_si128(static_cast<const __m128i*>(entries)));
}

TARGET_AVX2 inline __m256i Equal(__m256i bytes, char c) {
  return _mm256_cmpeq_epi8(bytes, _mm256_set1_epi8(c));
}

TARGET_AVX2 inline __m256i LookUp(const NibbleTables& tables, __m256i bytes) {
  const __m256i highNibbles = _mm256_and_si256(_mm256_srli_epi16(bytes, 4), _mm256_set1_epi8(0x0f));
  return _mm256_and_si256(_mm256_shuffle_epi8(TableOf(tables.low), bytes),
                          _mm256_shuffle_epi8(TableOf(tables.high), highNibbles));
}

TARGET_AVX2 inline std::uint32_t MaskOf(__m256i bytes) {
  return static_cast<std::uint32_t>(_mm256_movemask_epi8(bytes));
}

TARGET_AVX2 inline std::uint32_t MaskOfAny(__m256i classes, unsigned wanted) {
  const __m256i found = _mm256_and_si256(classes, _mm256_set1_epi8(static_cast<char>(wanted)));
  return ~MaskOf(_mm256_cmpeq_epi8(found, _mm256_setzero_si256()));
}

TARGET_AVX2 inline void ClassifyHalf(const char* at, int shift, BlockMasks* masks) {
  const __m256i bytes = Load(at);
  const __m256i classes = LookUp(kMaskTables, bytes);
  const auto put = [shift](std::uint32_t bits) { return std::uint64_t{bits} << shift; };
  const std::uint32_t semicolon = MaskOf(Equal(bytes, ';'));
  masks->terminator |= put(MaskOfAny(classes, kControl) | semicolon | MaskOf(Equal(bytes, ' ')));
  masks->semicolon |= put(semicolon);
  masks->lineFeed |= put(MaskOf(Equal(bytes, '\n')));
  masks->harmless |= put(MaskOfAny(classes, kHarmless));
  masks->dash |= put(MaskOf(Equal(bytes, '-')));
  masks->wordByte |= put(MaskOfAny(classes, kHarmless | kDash | kKeywordLetter));
}

// A byte that may stop has its highest bit set.
template <SkipWhere kWhere>
TARGET_AVX2 inline __m256i MayStop(const char* at, __m256i bytes) {
  constexpr bool kInCommand = kWhere == SkipWhere::InCommand;
  const __m256i before = Load(at - 1);
  const __m256i afterEnd = _mm256_cmpeq_epi8(_mm256_shuffle_epi8(TableOf(kWordEnds), before), before);
  const __m256i classes = LookUp(kInCommand ? kInCommandTables : kBetweenTables, bytes);
  const __m256i stops = _mm256_and_si256(afterEnd, _mm256_cmpeq_epi8(classes, _mm256_setzero_si256()));
  if constexpr (kInCommand) return _mm256_or_si256(stops, classes);
  return _mm256_or_si256(stops, _mm256_andnot_si256(classes, Equal(before, '-')));
}

struct Avx2 {
  TARGET_AVX2 static BlockMasks Classify(const char* block) {
    BlockMasks masks{};
    ClassifyHalf(block, 0, &masks);
    ClassifyHalf(block + 32, 32, &masks);
    return masks;
  }

  template <SkipWhere kWhere>
  TARGET_AVX2 [[gnu::noinline]] static const char* SkipWithoutStops(const char* block, const char* end,
                                                                    std::int32_t* lines) {
    constexpr std::ptrdiff_t kMostBlocks = 255 / 2;  // each adds up to 2 to a counter
    for (;;) {
      const char* const last = block + std::min((end - block) / kSkipBlock, kMostBlocks) * kSkipBlock;
      const char* at = block;
      __m256i counters = _mm256_setzero_si256();
      for (; at != last; at += kSkipBlock) {
        const __m256i first = Load(at);
        const __m256i second = Load(at + 32);
        const __m256i stops = _mm256_or_si256(MayStop<kWhere>(at, first), MayStop<kWhere>(at + 32, second));
        if (MaskOf(stops) != 0) break;
        counters = _mm256_sub_epi8(counters, Equal(first, '\n'));
        counters = _mm256_sub_epi8(counters, Equal(second, '\n'));
      }
      const __m256i sums = _mm256_sad_epu8(counters, _mm256_setzero_si256());
      const __m128i halves = _mm_add_epi32(_mm256_castsi256_si128(sums), _mm256_extracti128_si256(sums, 1));
      *lines += _mm_cvtsi128_si32(halves) + _mm_extract_epi32(halves, 2);
      if (at != last || last == block) return at;
      block = at;
    }
  }
};

}  // namespace

bool HasAvx2() {
  const bool avx2 = __builtin_cpu_supports("avx2") != 0;
  const bool bmi = __builtin_cpu_supports("bmi") != 0;
  const bool popcnt = __builtin_cpu_supports("popcnt") != 0;
  return avx2 & bmi & popcnt;
}

TARGET_AVX2 const char* SkipBetweenCommandsAvx2(const char* position, const char* end, std::int32_t* lines) {
  return SkipBlocks<SkipWhere::BetweenCommands, Avx2>(position, end, lines);
}

TARGET_AVX2 const char* SkipInCommandAvx2(const char* position, const char* end, std::int32_t* lines) {
  return SkipBlocks<SkipWhere::InCommand, Avx2>(position, end, lines);
}

}  // namespace scan

#endif
