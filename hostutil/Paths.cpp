// Conversion between UTF-8 and UTF-16 that loses no byte of a path.
#include "hostutil/PathsInternal.h"

#include <cstdint>
#include <cstdio>

#include "hostutil/BoundedTextInternal.h"
#include "hostutil/HostSetup.h"

namespace hostutil {
namespace {

constexpr char32_t kFirstSurrogate = 0xD800;
constexpr char32_t kFirstLowSurrogate = 0xDC00;
constexpr char32_t kLastSurrogate = 0xDFFF;
constexpr char32_t kFirstKeptByte = 0xDC80;
constexpr char32_t kLastKeptByte = 0xDCFF;
constexpr char32_t kFirstSupplementary = 0x10000;
constexpr char32_t kLastCodePoint = 0x10FFFF;
constexpr char32_t kHalfMask = 0x3FF;
constexpr int kHalfBits = 10;
constexpr int kContinuationBits = 6;
constexpr char32_t kContinuationMask = 0x3F;

bool IsSurrogate(char32_t c) { return c >= kFirstSurrogate && c <= kLastSurrogate; }
bool IsHighSurrogate(char32_t c) { return c >= kFirstSurrogate && c < kFirstLowSurrogate; }
bool IsLowSurrogate(char32_t c) { return c >= kFirstLowSurrogate && c <= kLastSurrogate; }
bool IsKeptByte(char32_t c) { return c >= kFirstKeptByte && c <= kLastKeptByte; }

// Line and paragraph separators end a line as a control character does.
bool BreaksLine(char32_t c) { return c < 0x20 || (c >= 0x7F && c < 0xA0) || c == 0x2028 || c == 0x2029; }

// How a multi-byte form begins: the lead byte's fixed bits, and the smallest code point that may have it.
struct LeadByte {
  unsigned char mask;
  unsigned char bits;
  int continuations;
  char32_t smallest;
};
constexpr LeadByte kLeadBytes[] = {
    {0xE0, 0xC0, 1, 0x80}, {0xF0, 0xE0, 2, 0x800}, {0xF8, 0xF0, 3, kFirstSupplementary}};

char32_t KeptByte(unsigned char byte) { return kFirstLowSurrogate + byte; }

DecodedCharacter DecodeMultiByte(const char* bytes) {
  const auto lead = static_cast<unsigned char>(bytes[0]);
  for (const LeadByte& form : kLeadBytes) {
    if ((lead & form.mask) != form.bits) continue;
    char32_t codePoint = lead & static_cast<unsigned char>(~form.mask);
    for (int i = 1; i <= form.continuations; ++i) {
      const auto next = static_cast<unsigned char>(bytes[i]);
      if ((next & 0xC0) != 0x80) return {KeptByte(lead), 1};
      codePoint = (codePoint << kContinuationBits) | (next & kContinuationMask);
    }
    if (codePoint < form.smallest || codePoint > kLastCodePoint || IsSurrogate(codePoint)) break;
    return {codePoint, form.continuations + 1};
  }
  return {KeptByte(lead), 1};
}

char Continuation(char32_t codePoint, int shift) {
  return static_cast<char>(0x80 | ((codePoint >> shift) & kContinuationMask));
}

}  // namespace

DecodedCharacter DecodeBytes(const char* bytes) {
  const auto lead = static_cast<unsigned char>(bytes[0]);
  return lead < 0x80 ? DecodedCharacter{lead, 1} : DecodeMultiByte(bytes);
}

DecodedCharacter DecodeUnits(const HostUTF16Unit* units) {
  if (!IsHighSurrogate(units[0]) || !IsLowSurrogate(units[1])) return {units[0], 1};
  const char32_t high = units[0] & kHalfMask;
  const char32_t low = units[1] & kHalfMask;
  return {kFirstSupplementary + ((high << kHalfBits) | low), kMostUnits};
}

int EncodeUnits(char32_t codePoint, HostUTF16Unit* units) {
  if (codePoint < kFirstSupplementary) {
    units[0] = static_cast<HostUTF16Unit>(codePoint);
    return 1;
  }
  const char32_t offset = codePoint - kFirstSupplementary;
  units[0] = static_cast<HostUTF16Unit>(kFirstSurrogate + (offset >> kHalfBits));
  units[1] = static_cast<HostUTF16Unit>(kFirstLowSurrogate + (offset & kHalfMask));
  return kMostUnits;
}

int EncodeBytes(char32_t codePoint, char* bytes) {
  if (codePoint < 0x80) {
    bytes[0] = static_cast<char>(codePoint);
    return 1;
  }
  int continuations = 1;
  while (continuations < 3 && codePoint >= kLeadBytes[continuations].smallest) ++continuations;
  const LeadByte& form = kLeadBytes[continuations - 1];
  bytes[0] = static_cast<char>(form.bits | (codePoint >> (continuations * kContinuationBits)));
  for (int i = 1; i <= continuations; ++i) {
    bytes[i] = Continuation(codePoint, (continuations - i) * kContinuationBits);
  }
  return continuations + 1;
}

char32_t Shown(char32_t codePoint) { return IsSurrogate(codePoint) ? kReplacementCharacter : codePoint; }

std::string PathBytes(const HostUTF16Unit* units) {
  std::string path;
  while (*units != 0) {
    const DecodedCharacter character = DecodeUnits(units);
    char bytes[kMostBytes];
    int length = 1;
    if (IsKeptByte(character.codePoint)) {
      bytes[0] = static_cast<char>(character.codePoint - kFirstLowSurrogate);
    } else {
      length = EncodeBytes(character.codePoint, bytes);
    }
    path.append(bytes, static_cast<std::size_t>(length));
    units += character.length;
  }
  return path;
}

std::string ShownLine(const HostUTF16Unit* units) {
  std::string line;
  while (*units != 0) {
    const DecodedCharacter character = DecodeUnits(units);
    units += character.length;
    if (BreaksLine(character.codePoint)) {
      char escaped[sizeof "\\u0000"];
      (void)std::snprintf(escaped, sizeof escaped, "\\u%04x",
                          static_cast<unsigned>(character.codePoint & 0xFFFF));
      line += escaped;
      continue;
    }
    char bytes[kMostBytes];
    line.append(bytes, static_cast<std::size_t>(EncodeBytes(Shown(character.codePoint), bytes)));
  }
  return line;
}

}  // namespace hostutil

std::int64_t HostPathToUnits(const char* path, HostUTF16Unit* units, std::int64_t capacity) {
  hostutil::BoundedText<HostUTF16Unit> out(units, capacity);
  while (path != nullptr && *path != '\0') {
    const hostutil::DecodedCharacter character = hostutil::DecodeBytes(path);
    HostUTF16Unit piece[hostutil::kMostUnits];
    out.Append(piece, hostutil::EncodeUnits(character.codePoint, piece));
    path += character.length;
  }
  return out.Needed();
}

std::int64_t HostUnitsToShownText(const HostUTF16Unit* units, char* text, std::int64_t capacity) {
  hostutil::BoundedText<char> out(text, capacity);
  while (units != nullptr && *units != 0) {
    const hostutil::DecodedCharacter character = hostutil::DecodeUnits(units);
    char piece[hostutil::kMostBytes];
    out.Append(piece, hostutil::EncodeBytes(hostutil::Shown(character.codePoint), piece));
    units += character.length;
  }
  return out.Needed();
}
