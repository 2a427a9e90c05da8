// Compares the reader of translation files with a second reader, and formats the texts.
#include <cstdint>
#include <cstring>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "fuzz/Bytes.h"
#include "fuzz/Lines.h"
#include "fuzz/MemoryFile.h"
#include "fuzz/Require.h"
#include "fuzz/Target.h"
#include "hostapi/ErrorCodes.h"
#include "hostutil/HostSetup.h"
#include "hostutil/HostStrings.h"
#include "refhost/Translations.h"
#include "tests/support/GuardedMemory.h"

namespace {

using fuzz::Require;
using Translations = std::vector<std::pair<std::string, std::string>>;

struct Expected {
  Translations translations;
  std::size_t badLine = 0;  // from 1; 0: none
};

Expected Read(std::string_view text) {
  Expected expected;
  std::size_t number = 0;
  fuzz::ForEachLine(text, [&](std::string_view line) {
    ++number;
    if (expected.badLine != 0 || line.empty() || line.front() == '#') return;
    const std::size_t equals = line.find('=');
    if (equals == std::string_view::npos) {
      expected.badLine = number;
    } else {
      expected.translations.emplace_back(line.substr(0, equals), line.substr(equals + 1));
    }
  });
  return expected;
}

// Every "^^1" and "^^2" of the pattern replaced, from left to right, once.
std::string Formatted(std::string_view pattern, std::string_view first, std::string_view second) {
  std::string text;
  while (!pattern.empty()) {
    const std::string_view marker = pattern.substr(0, 3);
    if (marker == "^^1" || marker == "^^2") {
      text += marker == "^^1" ? first : second;
      pattern.remove_prefix(marker.size());
    } else {
      text += pattern.front();
      pattern.remove_prefix(1);
    }
  }
  return text;
}

// Into a buffer that ends at a forbidden page. What does not fit is refused, not cut off.
void CheckFormat(const std::string& pattern, const std::string& first, const std::string& second) {
  static testsupport::GuardedMemory memory;
  constexpr std::size_t kCapacity = 96;
  char* const buffer = memory.Take(kCapacity);
  std::memset(buffer, '?', kCapacity);
  const HostError code =
      HostStringFormat(buffer, std::int64_t{kCapacity}, pattern.c_str(), first.c_str(), second.c_str());
  const std::string whole = Formatted(pattern.c_str(), first.c_str(), second.c_str());
  const bool fits = whole.size() < kCapacity;
  Require(code == (fits ? HOST_ERR_NONE : HOST_ERR_TEXT_TOO_LONG), "a text is formatted when it fits");
  Require(std::string_view(buffer) == (fits ? whole : ""), "a formatted text holds its arguments");
}

// The texts in a table of the host, looked up again.
void CheckLookUp(const Translations& translations) {
  constexpr const char* kEntries[] = {"k=default", "$$$/QZ/Maya_Import/LStr/0003=Error"};
  HostStringTable* table = nullptr;
  Require(HostRegisterStringTable("fuzz", kEntries, 2, &table) == HOST_ERR_NONE, "a table can be registered");
  std::string expected = "default";
  for (const auto& [key, text] : translations) {
    Require(HostSetTranslation(key.c_str(), text.c_str()) == HOST_ERR_NONE, "a translation is taken");
    if (std::string_view(key.c_str()) == "k") expected = text.c_str();
  }
  Require(HostLocalizedString(table, 0) == expected, "the last translation of a key is looked up");
  Require(HostUnregisterStringTable(table) == HOST_ERR_NONE, "a table can be given back");
  HostClearTranslations();
}

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  static fuzz::MemoryFile file;
  const std::string_view text = fuzz::TextOf(data, size);
  file.Write(text);
  std::string complaint;
  const auto read = refhost::readTranslations(file.path(), &complaint);
  const Expected expected = Read(text);
  Require(read.has_value() == (expected.badLine == 0), "a line without \"=\" is refused");
  if (!read) {
    const std::string place = ":" + std::to_string(expected.badLine) + ":";
    Require(complaint.find(place) != std::string::npos, "the complaint names the line");
    return 0;
  }
  Require(*read == expected.translations, "every line is read");
  CheckLookUp(*read);
  if (!read->empty()) CheckFormat(read->front().second, read->front().first, read->back().second);
  return 0;
}
