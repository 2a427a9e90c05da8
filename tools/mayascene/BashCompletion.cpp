#include <string_view>

#include "tools/mayascene/Completions.h"

namespace mayascene {
namespace {

std::string joined(const std::vector<std::string>& words, std::string_view between) {
  std::string text;
  for (const std::string& word : words) text.append(text.empty() ? "" : between).append(word);
  return text;
}

// The values of the options that take one. Nothing is proposed for a value that is neither a word nor a file.
std::string valueCases(const CommandTable& table) {
  std::string text;
  for (const OptionGroup& group : table.groups) {
    for (const OptionRow& row : group.options) {
      if (row.form.empty()) continue;
      text += "        " + joined(row.names, " | ") + ")\n";
      if (row.isFile()) text += "          _mayascene_files\n";
      if (!row.words.empty()) text += "          _mayascene_words '" + joined(row.words, " ") + "'\n";
      text += "          return\n          ;;\n";
    }
  }
  return text.empty() ? "" : "      case $before in\n" + text + "      esac\n";
}

std::string commandCase(const CommandTable& table) {
  std::vector<std::string> names, words;
  bool files = false;
  for (const OptionGroup& group : table.groups) {
    for (const OptionRow& row : group.options) names.insert(names.end(), row.names.begin(), row.names.end());
  }
  for (const OptionRow& row : table.positionals) {
    words.insert(words.end(), row.words.begin(), row.words.end());
    files = files || row.isFile();
  }
  for (const CommandTable& verb : table.verbs) words.push_back(verb.verb());
  std::string text = "    '" + table.command + "')\n" + valueCases(table);
  text += "      if [[ $current == -* ]]; then\n        _mayascene_words '" + joined(names, " ") + "'\n";
  text += "      else\n";
  text += files ? "        _mayascene_scenes\n" : "        _mayascene_words '" + joined(words, " ") + "'\n";
  return text + "      fi\n      ;;\n";
}

// The verbs that are named before the cursor.
std::string verbCase(const CommandTable& tool) {
  std::vector<std::string> commands;
  for (const CommandTable* table : allTables(tool)) {
    if (table != &tool) commands.push_back('\'' + table->command + '\'');
  }
  return joined(commands, " | ");
}

constexpr std::string_view kHead = R"(# bash completion for mayascene

_mayascene_words() {
  mapfile -t COMPREPLY < <(compgen -W "$1" -- "$current")
}

_mayascene_files() {
  compopt -o filenames 2>/dev/null
  mapfile -t COMPREPLY < <(compgen -f -- "$current")
}

_mayascene_scenes() {
  compopt -o filenames 2>/dev/null
  mapfile -t COMPREPLY < <(compgen -d -- "$current"; compgen -f -X '!*.ma' -- "$current")
}

_mayascene() {
  local current=${COMP_WORDS[COMP_CWORD]} before=${COMP_WORDS[COMP_CWORD - 1]} command=mayascene i
  COMPREPLY=()
  # In "--option=value" the sign is a word of its own.
  if [[ $current == '=' ]]; then
    current=
  elif [[ $before == '=' ]]; then
    before=${COMP_WORDS[COMP_CWORD - 2]}
  fi
  for ((i = 1; i < COMP_CWORD; ++i)); do
    case "$command ${COMP_WORDS[i]}" in
)";

}  // namespace

std::string bashCompletion(const CommandTable& tool) {
  std::string text(kHead);
  text +=
      "      " + verbCase(tool) + ")\n        command+=\" ${COMP_WORDS[i]}\"\n        ;;\n    esac\n  done\n";
  text += "  case $command in\n";
  for (const CommandTable* table : allTables(tool)) text += commandCase(*table);
  return text + "  esac\n}\n\ncomplete -F _mayascene mayascene\n";
}

}  // namespace mayascene
