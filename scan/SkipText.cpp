#include "scan/SkipText.h"

#include <array>

#include "scan/SkipTextBlocks.h"
#include "scan/SkipTextX86.h"

namespace scan {
namespace {

constexpr bool BeginsHarmlessWord(const char* at) {
  return *at == '-' ? IsWordByte(at[1]) : IsWordByte(*at) && !IsAny(*at, kKeywordStart);
}

// A byte at a time. Stops a block before the end of the text, as the others do, so that no word is scanned
// beyond it.
template <SkipWhere kWhere>
const char* SkipPlain(const char* position, const char* end, std::int32_t* lines) {
  constexpr bool kInCommand = kWhere == SkipWhere::InCommand;
  while (end - position >= kSkipBlock) {
    if (IsWordEnd(*position) && !(kInCommand && *position == ';')) {
      *lines += *position == '\n' ? 1 : 0;
      ++position;
      continue;
    }
    if (!BeginsHarmlessWord(position) || (kInCommand && *position == '-')) return position;
    const char* after = position;
    while (after != end && !IsWordEnd(*after)) ++after;
    if (after == end) return position;
    position = after;
  }
  return position;
}

constexpr TextSkipper kPlain = {"plain", SkipPlain<SkipWhere::BetweenCommands>,
                                SkipPlain<SkipWhere::InCommand>};

}  // namespace

std::span<const TextSkipper> TextSkippers() {
#if defined(__x86_64__)
  static constexpr std::array<TextSkipper, 3> kSkippers = {
      {kPlain,
       {"SSE2", SkipBetweenCommandsSse2, SkipInCommandSse2},
       {"AVX2", SkipBetweenCommandsAvx2, SkipInCommandAvx2}}};
  return std::span(kSkippers).first(2 + std::size_t{HasAvx2()});
#else
  static constexpr std::array<TextSkipper, 1> kSkippers = {kPlain};
  return kSkippers;
#endif
}

}  // namespace scan
