#include "tools/mayascene/CommandTable.h"

#include <algorithm>
#include <cstddef>

namespace mayascene {

bool OptionRow::isFile() const {
  return form == "FILE" || form == "OUT" || (form.empty() && names.front() == "SCENE");
}

std::string CommandTable::verb() const { return command.substr(command.rfind(' ') + 1); }

std::vector<const CommandTable*> allTables(const CommandTable& table) {
  std::vector<const CommandTable*> all = {&table};
  for (std::size_t at = 0; at < all.size(); ++at) {
    const std::vector<CommandTable>& verbs = all[at]->verbs;
    auto place = all.begin() + static_cast<std::ptrdiff_t>(at) + 1;
    for (const CommandTable& verb : verbs) place = all.insert(place, &verb) + 1;
  }
  return all;
}

std::vector<std::string> linesOf(std::string_view text) {
  std::vector<std::string> lines;
  for (std::size_t begin = 0; begin <= text.size();) {
    const std::size_t end = std::min(text.find('\n', begin), text.size());
    lines.emplace_back(text.substr(begin, end - begin));
    begin = end + 1;
  }
  return lines;
}

}  // namespace mayascene
