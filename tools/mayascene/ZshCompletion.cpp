#include <algorithm>
#include <string_view>

#include "tools/mayascene/Completions.h"

namespace mayascene {
namespace {

// For a text in single quotes, with the signs escaped that end a description.
std::string escaped(std::string_view text) {
  std::string out;
  for (const char c : text) {
    if (c == '\'') {
      out += "'\\''";
    } else if (c == '\n') {
      out += ' ';
    } else {
      if (c == '[' || c == ']' || c == ':' || c == '\\') out += '\\';
      out += c;
    }
  }
  return out;
}

std::string actionOf(const OptionRow& row) {
  if (row.isFile()) return row.form.empty() ? "_files -g \"*.ma\"" : "_files";
  std::string words;
  for (const std::string& word : row.words) words += (words.empty() ? "" : " ") + word;
  return words.empty() ? " " : '(' + words + ')';
}

std::string specification(const OptionRow& row) {
  std::string text;
  for (const std::string& name : row.names) {
    text += " \\\n    '" + std::string(row.repeated ? "*" : "") + name + '[' + escaped(row.text) + ']';
    if (!row.form.empty()) text += ':' + escaped(row.form) + ':' + actionOf(row);
    text += '\'';
  }
  return text;
}

std::string functionOf(const CommandTable& table) {
  std::string name = "_" + table.command;
  std::replace(name.begin(), name.end(), ' ', '_');
  std::string text = name + "() {\n  local curcontext=$curcontext state line\n  _arguments -s -S -C";
  for (const OptionGroup& group : table.groups) {
    for (const OptionRow& row : group.options) text += specification(row);
  }
  for (const OptionRow& row : table.positionals) {
    text += " \\\n    '" + std::string(row.repeated ? "*" : "") + ':' + row.names.front() + ':' +
            actionOf(row) + '\'';
  }
  if (table.verbs.empty()) return text + "\n}\n\n";
  text += " \\\n    '1:verb:((";
  for (const CommandTable& verb : table.verbs) {
    text += verb.verb() + "\\:\"" + escaped(verb.sentence) + "\" ";
  }
  text.pop_back();
  text += "))' \\\n    '*::argument:->rest'\n  [[ $state == rest ]] || return\n  case $line[1] in\n";
  for (const CommandTable& verb : table.verbs) {
    text += "    " + verb.verb() + ") " + name + '_' + verb.verb() + " ;;\n";
  }
  return text + "  esac\n}\n\n";
}

}  // namespace

std::string zshCompletion(const CommandTable& tool) {
  std::string text = "#compdef mayascene\n\n";
  for (const CommandTable* table : allTables(tool)) text += functionOf(*table);
  return text + "_mayascene \"$@\"\n";
}

}  // namespace mayascene
