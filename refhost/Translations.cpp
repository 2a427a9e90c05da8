#include "refhost/Translations.h"

#include <cstddef>
#include <fstream>

#include "refhost/ShownText.h"

namespace refhost {

std::optional<std::vector<std::pair<std::string, std::string>>> readTranslations(
    const std::filesystem::path& file, std::string* complaint) {
  std::vector<std::pair<std::string, std::string>> translations;
  std::ifstream in(file, std::ios::binary);
  bool readable = in.is_open();
  std::size_t number = 0;
  for (std::string line; readable && std::getline(in, line);) {
    ++number;
    if (!line.empty() && line.back() == '\r') line.pop_back();
    if (line.empty() || line.front() == '#') continue;
    const std::size_t equals = line.find('=');
    if (equals == std::string::npos) {
      *complaint = shownText(file.native()) + ":" + std::to_string(number) + ": the line has no \"=\"";
      return std::nullopt;
    }
    translations.emplace_back(line.substr(0, equals), line.substr(equals + 1));
  }
  readable = readable && !in.bad();
  if (!readable) {
    *complaint = shownText(file.native()) + " cannot be read";
    return std::nullopt;
  }
  return translations;
}

}  // namespace refhost
