#include "refhost/Preferences.h"

#include <charconv>
#include <cstdlib>
#include <fstream>
#include <string_view>
#include <system_error>
#include <utility>

#include "text/FileBeside.h"

namespace refhost {
namespace {

namespace fs = std::filesystem;

// The whole text as an integer; nothing when it is not one or does not fit.
std::optional<std::int32_t> integerOf(std::string_view text) {
  std::int32_t value = 0;
  const auto result = std::from_chars(text.data(), text.data() + text.size(), value);
  if (result.ec != std::errc{} || result.ptr != text.data() + text.size()) return std::nullopt;
  return value;
}

bool fitsALine(const std::string& name) { return name.find_first_of("\r\n") == std::string::npos; }

bool isAbsoluteFolder(const char* text) { return text != nullptr && fs::path(text).is_absolute(); }

}  // namespace

Preferences::Preferences(fs::path file) : file_(std::move(file)) {
  std::error_code error;
  existed_ = !file_.empty() && fs::exists(fs::symlink_status(file_, error));
  if (!existed_ || !fs::is_regular_file(file_, error)) return;
  std::ifstream in(file_, std::ios::binary);
  std::map<std::string, std::int32_t>* section = nullptr;
  for (std::string line; std::getline(in, line);) {
    if (!line.empty() && line.back() == '\r') line.pop_back();
    if (line.size() >= 2 && line.front() == '[' && line.back() == ']') {
      section = &sections_[line.substr(1, line.size() - 2)];
      continue;
    }
    // The last "=": a key may hold one, an integer cannot.
    const std::size_t equals = line.rfind('=');
    if (section == nullptr || equals == std::string::npos) continue;
    const auto value = integerOf(std::string_view(line).substr(equals + 1));
    if (value) (*section)[line.substr(0, equals)] = *value;
  }
}

std::optional<std::int32_t> Preferences::find(const std::string& section, const std::string& key) const {
  const auto entries = sections_.find(section);
  if (entries == sections_.end()) return std::nullopt;
  const auto entry = entries->second.find(key);
  if (entry == entries->second.end()) return std::nullopt;
  return entry->second;
}

void Preferences::set(const std::string& section, const std::string& key, std::int32_t value) {
  sections_[section][key] = value;
}

bool Preferences::fileExists() const { return existed_; }

bool Preferences::write(std::string* failure) const {
  if (file_.empty()) {
    *failure = "the preferences have no file";
    return false;
  }
  std::string lines;
  for (const auto& [section, entries] : sections_) {
    if (!fitsALine(section)) continue;
    lines += '[' + section + "]\n";
    for (const auto& [key, value] : entries) {
      if (fitsALine(key)) lines += key + '=' + std::to_string(value) + '\n';
    }
  }
  std::error_code ignored;
  const fs::path place = fs::weakly_canonical(file_, ignored);
  if (place.has_parent_path()) fs::create_directories(place.parent_path(), ignored);
  if (text::ReplaceFile(file_.string(), lines)) return true;
  *failure = "the preferences cannot be written to " + file_.string();
  return false;
}

fs::path Preferences::userFile() {
  const char* config = std::getenv("XDG_CONFIG_HOME");
  const char* home = std::getenv("HOME");
  fs::path folder;
  if (isAbsoluteFolder(config)) {
    folder = config;
  } else if (isAbsoluteFolder(home)) {
    folder = fs::path(home) / ".config";
  } else {
    return {};
  }
  return folder / "mayascene" / "preferences";
}

}  // namespace refhost
