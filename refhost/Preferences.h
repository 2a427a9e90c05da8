// The preference store: a small text file of sections and 32-bit integers.
//
//   [Maya Camera]
//   Use Linear Units=0
//
// A missing file counts as empty. The host writes the file only when it is missing, or when a user sets a
// preference: it writes a new file beside it and renames that. A failure to write changes nothing else.
#pragma once

#include <cstdint>
#include <filesystem>
#include <map>
#include <optional>
#include <string>

namespace refhost {

class Preferences {
 public:
  // Reads the file. Lines that are no entry are ignored. With an empty path the store is in memory only.
  explicit Preferences(std::filesystem::path file);

  std::optional<std::int32_t> find(const std::string& section, const std::string& key) const;
  void set(const std::string& section, const std::string& key, std::int32_t value);

  bool fileExists() const;                 // whether the file was there when it was read
  bool write(std::string* failure) const;  // false with a sentence when it cannot be written

  // The path of the user's own store: mayascene/preferences in $XDG_CONFIG_HOME or in ~/.config. Empty when
  // neither is known.
  static std::filesystem::path userFile();

 private:
  std::filesystem::path file_;
  bool existed_ = false;
  std::map<std::string, std::map<std::string, std::int32_t>> sections_;
};

}  // namespace refhost
