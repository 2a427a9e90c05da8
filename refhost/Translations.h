// The host's translations of localised strings: a file of lines KEY=TEXT, UTF-8. Blank lines and lines that
// begin with "#" are skipped.
#pragma once

#include <filesystem>
#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace refhost {

// Nothing when the file cannot be read or a line has no "="; *complaint then says which.
std::optional<std::vector<std::pair<std::string, std::string>>> readTranslations(
    const std::filesystem::path& file, std::string* complaint);

}  // namespace refhost
