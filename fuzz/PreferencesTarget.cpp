// The reader of preference files, against a second reader.
#include <cstdint>
#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <utility>

#include "fuzz/Bytes.h"
#include "fuzz/Lines.h"
#include "fuzz/MemoryFile.h"
#include "fuzz/Require.h"
#include "fuzz/Target.h"
#include "refhost/Preferences.h"

namespace {

using fuzz::Require;
using Entries = std::map<std::pair<std::string, std::string>, std::int32_t>;

// Decimal digits with an optional "-" that fit 32 bits, and nothing else.
std::optional<std::int32_t> IntegerOf(std::string_view text) {
  constexpr std::int64_t kBeyond = std::int64_t{1} << 31;
  const bool negative = !text.empty() && text.front() == '-';
  const std::string_view digits = text.substr(negative ? 1 : 0);
  std::int64_t value = 0;
  for (const char c : digits) {
    if (c < '0' || c > '9') return std::nullopt;
    value = value * 10 + (c - '0');
    if (value > kBeyond) return std::nullopt;
  }
  if (digits.empty() || (!negative && value == kBeyond)) return std::nullopt;
  return static_cast<std::int32_t>(negative ? -value : value);
}

Entries Expected(std::string_view text) {
  Entries entries;
  std::optional<std::string> section;
  fuzz::ForEachLine(text, [&](std::string_view line) {
    if (line.size() >= 2 && line.front() == '[' && line.back() == ']') {
      section = std::string(line.substr(1, line.size() - 2));
      return;
    }
    const std::size_t equals = line.rfind('=');
    if (!section || equals == std::string_view::npos) return;
    const std::optional<std::int32_t> value = IntegerOf(line.substr(equals + 1));
    if (value) entries[{*section, std::string(line.substr(0, equals))}] = *value;
  });
  return entries;
}

void CheckEntries(const refhost::Preferences& preferences, const Entries& expected) {
  for (const auto& [place, value] : expected)
    Require(preferences.find(place.first, place.second) == value, "an entry is read");
}

// A value more than the file has, beside which the others stay.
void CheckAddition(refhost::Preferences& preferences, Entries expected) {
  constexpr std::int32_t kValue = -7;
  preferences.set("Maya Camera", "Use Linear Units", kValue);
  expected[{"Maya Camera", "Use Linear Units"}] = kValue;
  CheckEntries(preferences, expected);
}

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  static fuzz::MemoryFile file;
  const std::string_view text = fuzz::TextOf(data, size);
  file.Write(text);
  refhost::Preferences preferences(file.path());
  Require(preferences.fileExists(), "a file that is there is seen");
  const Entries expected = Expected(text);
  CheckEntries(preferences, expected);
  Require(!preferences.find("a section that no file has\n", "a key"),
          "an entry that is not there is not read");
  CheckAddition(preferences, expected);
  return 0;
}
