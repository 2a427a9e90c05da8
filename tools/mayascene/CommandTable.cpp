#include "tools/mayascene/CommandTable.h"

#include <algorithm>

namespace mayascene {

bool OptionRow::isFile() const {
  return form == "FILE" || form == "OUT" || (form.empty() && names.front() == "SCENE");
}

std::string CommandTable::verb() const { return command.substr(command.rfind(' ') + 1); }

std::vector<const CommandTable*> allTables(const CommandTable& table) {
  std::vector<const CommandTable*> all = {&table};
  for (const CommandTable& verb : table.verbs) {
    for (const CommandTable* one : allTables(verb)) all.push_back(one);
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
