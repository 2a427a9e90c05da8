// Tables of localised strings, their translations, and the formatter into bounded buffers.
#include "hostutil/HostStrings.h"

#include <algorithm>
#include <cstdint>
#include <cstring>
#include <map>
#include <memory>
#include <new>
#include <string>
#include <vector>

#include "hostapi/ErrorCodes.h"
#include "hostutil/BoundedTextInternal.h"
#include "hostutil/FormatInternal.h"
#include "hostutil/HostSetup.h"
#include "hostutil/RehearsalInternal.h"

struct HostStringTable {
  struct Entry {
    std::string key;
    std::string text;  // the default
  };
  std::string name;
  std::vector<Entry> entries;
};

namespace {

std::vector<std::unique_ptr<HostStringTable>> tables;
std::map<std::string, std::string> translations;  // by key

auto FindTable(const HostStringTable* table) {
  return std::find_if(tables.begin(), tables.end(), [&](const auto& held) { return held.get() == table; });
}

bool NameTaken(const char* name) {
  return std::any_of(tables.begin(), tables.end(), [&](const auto& held) { return held->name == name; });
}

// False when an entry has no "=". The key ends at the first one.
bool ReadEntries(const char* const* entries, std::int32_t count, HostStringTable* table) {
  for (std::int32_t i = 0; i < count; ++i) {
    const char* equals = entries[i] != nullptr ? std::strchr(entries[i], '=') : nullptr;
    if (equals == nullptr) return false;
    table->entries.push_back({std::string(entries[i], equals), std::string(equals + 1)});
  }
  return true;
}

std::int64_t LengthOf(const char* text) { return static_cast<std::int64_t>(std::strlen(text)); }

HostError Finish(hostutil::BoundedText<char>* out) {
  if (out->Fits()) return HOST_ERR_NONE;
  out->Clear();
  return HOST_ERR_TEXT_TOO_LONG;
}

void HandOutEmptyText(char* buffer, std::int64_t capacity) {
  if (buffer != nullptr && capacity > 0) buffer[0] = '\0';
}

}  // namespace

HostError HostRegisterStringTable(const char* name, const char* const* entries, std::int32_t count,
                                  HostStringTable** table) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_RegisterStringTable, &code)) {
    hostutil::HandOutNothing(table);
    return code;
  }
  if (table == nullptr) return HOST_ERR_UTILITY_NULL;
  *table = nullptr;
  if (name == nullptr || (entries == nullptr && count != 0)) return HOST_ERR_UTILITY_NULL;
  if (count < 0 || NameTaken(name)) return HOST_ERR_STRING_TABLE;
  try {
    auto made = std::make_unique<HostStringTable>();
    made->name = name;
    if (!ReadEntries(entries, count, made.get())) return HOST_ERR_STRING_TABLE;
    tables.push_back(std::move(made));
  } catch (const std::bad_alloc&) {
    return HOST_ERR_STRING_TABLE;
  }
  *table = tables.back().get();
  return HOST_ERR_NONE;
}

HostError HostUnregisterStringTable(HostStringTable* table) {
  if (table == nullptr) return HOST_ERR_NONE;
  const auto found = FindTable(table);
  if (found == tables.end()) return HOST_ERR_UTILITY_NULL;
  tables.erase(found);
  return HOST_ERR_NONE;
}

const char* HostLocalizedString(const HostStringTable* table, std::int32_t id) {
  if (FindTable(table) == tables.end()) return "";
  if (id < 0 || static_cast<std::size_t>(id) >= table->entries.size()) return "";
  const HostStringTable::Entry& entry = table->entries[static_cast<std::size_t>(id)];
  const auto translated = translations.find(entry.key);
  return translated != translations.end() ? translated->second.c_str() : entry.text.c_str();
}

HostError HostStringCopy(char* buffer, std::int64_t capacity, const char* text) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_StringCopy, &code)) {
    HandOutEmptyText(buffer, capacity);
    return code;
  }
  if (buffer == nullptr || text == nullptr) return HOST_ERR_UTILITY_NULL;
  const std::int64_t length = LengthOf(text);
  hostutil::BoundedText<char> out(buffer, capacity);
  out.Append(text, length);
  return Finish(&out);
}

HostError HostStringFormat(char* buffer, std::int64_t capacity, const char* pattern, const char* argument1,
                           const char* argument2) {
  if (HostError code; hostutil::Rehearsed(HOST_UTILITY_StringFormat, &code)) {
    HandOutEmptyText(buffer, capacity);
    return code;
  }
  if (buffer == nullptr || pattern == nullptr) return HOST_ERR_UTILITY_NULL;
  const char* const arguments[] = {argument1 != nullptr ? argument1 : "",
                                   argument2 != nullptr ? argument2 : ""};
  hostutil::BoundedText<char> out(buffer, capacity);
  hostutil::WalkPattern(
      pattern,
      [&](const char* text) {
        out.Append(text, 1);
        return 1;
      },
      [&](int number) { out.Append(arguments[number], LengthOf(arguments[number])); });
  return Finish(&out);
}

HostError HostSetTranslation(const char* key, const char* text) {
  if (key == nullptr || text == nullptr) return HOST_ERR_UTILITY_NULL;
  try {
    translations[key] = text;
  } catch (const std::bad_alloc&) {
    return HOST_ERR_TEXT_MEMORY;
  }
  return HOST_ERR_NONE;
}

void HostClearTranslations(void) { translations.clear(); }
