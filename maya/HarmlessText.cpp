#include "maya/HarmlessText.h"

#include <array>

#include "maya/HarmlessTextLoop.h"
#include "maya/HarmlessTextX86.h"

namespace {

constexpr bool BeginsHarmlessWord(const char* at) {
  return *at == '-' ? IsWordByte(at[1]) : IsWordByte(*at) && !IsAny(*at, kKeywordStartClass);
}

enum ByteClass : unsigned char { kInWord, kTerminator, kLineFeed };

constexpr auto kByteClasses = [] {
  std::array<ByteClass, 256> classes{};
  for (const char c : {' ', '\t', '\r', ';'}) classes[static_cast<unsigned char>(c)] = kTerminator;
  classes['\n'] = kLineFeed;
  return classes;
}();

ByteClass ClassOf(char c) { return kByteClasses[static_cast<unsigned char>(c)]; }

// A byte at a time. Ends a block before the end, as the others do, so that no word is scanned over it.
template <SkipWhere kWhere>
const char* SkipPlain(const char* position, const char* end, std::int32_t* lines) {
  constexpr bool inCommand = kWhere == SkipWhere::InCommand;
  while (end - position >= kSkipBlock) {
    const ByteClass first = ClassOf(*position);
    if (first != kInWord && !(inCommand && *position == ';')) {
      *lines += first == kLineFeed ? 1 : 0;
      ++position;
      continue;
    }
    if (!BeginsHarmlessWord(position) || (inCommand && *position == '-')) return position;
    const char* behind = position;
    while (behind != end && ClassOf(*behind) == kInWord) ++behind;
    if (behind == end) return position;
    position = behind;
  }
  return position;
}

constexpr HarmlessTextSkipper kPlain = {"plain", SkipPlain<SkipWhere::BetweenCommands>,
                                        SkipPlain<SkipWhere::InCommand>};

}  // namespace

std::span<const HarmlessTextSkipper> HarmlessTextSkippers() {
#if defined(__x86_64__)
  static constexpr std::array<HarmlessTextSkipper, 3> kSkippers = {
      {kPlain,
       {"SSE2", SkipHarmlessTextSse2, SkipInCommandSse2},
       {"AVX2", SkipHarmlessTextAvx2, SkipInCommandAvx2}}};
  const std::size_t count = HasAvx2() ? 3 : 2;
  return std::span(kSkippers).first(count);
#else
  static constexpr std::array<HarmlessTextSkipper, 1> kSkippers = {kPlain};
  return kSkippers;
#endif
}
