// The reference-counted texts, and what is built from them.
#include "hostutil/UTF16String.h"

#include <algorithm>
#include <cstdint>
#include <new>
#include <utility>
#include <vector>

#include "hostapi/ErrorCodes.h"
#include "hostutil/FormatInternal.h"
#include "hostutil/PathsInternal.h"
#include "hostutil/RehearsalInternal.h"
#include "hostutil/UTF16StringInternal.h"

namespace {

constexpr HostUTF16Unit kNoUnits[] = {0};
constexpr HostUTF16Unit kDot = '.';

using Units = std::vector<HostUTF16Unit>;

std::int64_t LengthOf(const HostUTF16Unit* units) {
  std::int64_t length = 0;
  while (units[length] != 0) ++length;
  return length;
}

void Append(Units* units, const HostUTF16Unit* piece, std::int64_t count) {
  units->insert(units->end(), piece, piece + count);
}

// Appends the first character of the bytes; returns how many bytes it took.
int AppendCharacter(Units* units, const char* bytes) {
  const hostutil::DecodedCharacter character = hostutil::DecodeBytes(bytes);
  HostUTF16Unit piece[hostutil::kMostUnits];
  Append(units, piece, hostutil::EncodeUnits(character.codePoint, piece));
  return character.length;
}

// Hands out a new text of the units that `fill` appends.
template <typename Fill>
HostError MakeText(UTF16String** text, Fill fill) {
  *text = nullptr;
  try {
    Units units;
    fill(&units);
    units.push_back(0);
    *text = new UTF16String(std::move(units));
  } catch (const std::bad_alloc&) {
    return HOST_ERR_TEXT_MEMORY;
  }
  return HOST_ERR_NONE;
}

// Where the extension begins: at the last dot, or at the end.
std::int64_t ExtensionStart(const UTF16String* text) {
  const HostUTF16Unit* units = UTF16StringUnits(text);
  const std::int64_t length = UTF16StringLength(text);
  for (std::int64_t i = length; i > 0; --i) {
    if (units[i - 1] == kDot) return i - 1;
  }
  return length;
}

}  // namespace

HostError UTF16StringMakeFromUnits(const HostUTF16Unit* units, UTF16String** text) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_StringMake, &code)) {
    hostutil::HandOutNothing(text);
    return code;
  }
  if (text == nullptr) return HOST_ERR_UTILITY_NULL;
  *text = nullptr;
  if (units == nullptr) return HOST_ERR_UTILITY_NULL;
  return MakeText(text, [&](Units* out) { Append(out, units, LengthOf(units)); });
}

HostError UTF16StringMakeFromBytes(const char* bytes, UTF16String** text) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_StringMake, &code)) {
    hostutil::HandOutNothing(text);
    return code;
  }
  if (text == nullptr) return HOST_ERR_UTILITY_NULL;
  *text = nullptr;
  if (bytes == nullptr) return HOST_ERR_UTILITY_NULL;
  return MakeText(text, [&](Units* out) {
    for (const char* at = bytes; *at != '\0';) at += AppendCharacter(out, at);
  });
}

HostError UTF16StringFormat(const char* pattern, const UTF16String* argument1, const UTF16String* argument2,
                            UTF16String** text) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_StringFormat, &code)) {
    hostutil::HandOutNothing(text);
    return code;
  }
  if (text == nullptr) return HOST_ERR_UTILITY_NULL;
  *text = nullptr;
  if (pattern == nullptr) return HOST_ERR_UTILITY_NULL;
  const UTF16String* const arguments[] = {argument1, argument2};
  return MakeText(text, [&](Units* out) {
    hostutil::WalkPattern(
        pattern, [&](const char* rest) { return AppendCharacter(out, rest); },
        [&](int number) {
          Append(out, UTF16StringUnits(arguments[number]), UTF16StringLength(arguments[number]));
        });
  });
}

HostError HostStripExtension(const UTF16String* text, std::int32_t flag, UTF16String** stripped) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_StripExtension, &code)) {
    hostutil::HandOutNothing(stripped);
    return code;
  }
  if (stripped == nullptr) return HOST_ERR_UTILITY_NULL;
  const std::int64_t kept = flag != 0 ? ExtensionStart(text) : UTF16StringLength(text);
  return MakeText(stripped, [&](Units* out) { Append(out, UTF16StringUnits(text), kept); });
}

const HostUTF16Unit* UTF16StringUnits(const UTF16String* text) {
  return text != nullptr ? text->units.data() : kNoUnits;
}

std::int64_t UTF16StringLength(const UTF16String* text) {
  return text != nullptr ? static_cast<std::int64_t>(text->units.size()) - 1 : 0;
}

void UTF16StringRetain(UTF16String* text) {
  if (text != nullptr) ++text->references;
}

void UTF16StringRelease(UTF16String* text) {
  if (text == nullptr || --text->references != 0) return;
  delete text;
}
