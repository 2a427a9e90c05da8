// Compares the reader and the writer of preference files with a second reader.
#include <cstdint>
#include <filesystem>
#include <iterator>
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
#include "hostapi/PersistentDataSuite.h"
#include "refhost/Preferences.h"
#include "tests/support/TemporaryFolder.h"

namespace {

using fuzz::Require;
using Entries = std::map<std::pair<std::string, std::string>, std::int32_t>;

constexpr const char* kFileName = "preferences";
// One text of this many is written too, which takes ten times as long as reading.
constexpr std::size_t kOneIn = 16;

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

void Add(refhost::Preferences& preferences, Entries& entries, std::string_view section, std::string_view key,
         std::int32_t value) {
  preferences.set(std::string(section), std::string(key), value);
  entries[{std::string(section), std::string(key)}] = value;
}

// Adds values to those of the file, which stay. Two have names of any bytes.
void CheckAdditions(refhost::Preferences& preferences, Entries& entries, std::string_view text) {
  constexpr std::int32_t kValue = -7;
  const std::size_t half = text.size() / 2;
  Add(preferences, entries, text.substr(0, half), "key", kValue);
  Add(preferences, entries, "section", text.substr(half), kValue);
  Add(preferences, entries, HOST_PREF_SECTION, HOST_PREF_LINEAR_UNITS, kValue);
  CheckEntries(preferences, entries);
}

bool FitsALine(std::string_view name) { return name.find_first_of("\r\n") == std::string_view::npos; }

// What a file can hold: all but the names with a line end.
Entries Writable(Entries entries) {
  std::erase_if(entries, [](const auto& entry) {
    return !FitsALine(entry.first.first) || !FitsALine(entry.first.second);
  });
  return entries;
}

void Write(const refhost::Preferences& preferences, const std::filesystem::path& folder) {
  std::string failure;
  Require(preferences.write(&failure), "preferences can be written");
  Require(failure.empty(), "a file that is written has no failure");
  const auto files = std::filesystem::directory_iterator(folder);
  Require(std::distance(begin(files), end(files)) == 1, "nothing is left beside the file");
}

// Reads the text as a file, writes it, reads it back and writes it again.
void CheckWriter(std::string_view text, Entries entries) {
  static const testsupport::TemporaryFolder folder;
  refhost::Preferences preferences(folder.write(kFileName, text));
  CheckAdditions(preferences, entries, text);
  Write(preferences, folder.path());
  const std::string bytes = folder.read(kFileName);
  const Entries writable = Writable(entries);
  Require(Expected(bytes) == writable, "the file holds each entry that it can hold, and no other");
  const refhost::Preferences again(folder.path() / kFileName);
  CheckEntries(again, writable);
  Write(again, folder.path());
  Require(folder.read(kFileName) == bytes, "what is read back is written as it was");
}

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  static fuzz::MemoryFile file;
  const std::string_view text = fuzz::TextOf(data, size);
  file.Write(text);
  refhost::Preferences preferences(file.path());
  Require(preferences.fileExists(), "a file that is there is seen");
  Entries entries = Expected(text);
  CheckEntries(preferences, entries);
  Require(!preferences.find("a section that no file has\n", "a key"),
          "an entry that is not there is not read");
  if (size % kOneIn == 0) CheckWriter(text, entries);
  CheckAdditions(preferences, entries, text);
  return 0;
}
