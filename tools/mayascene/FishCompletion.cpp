#include <string_view>

#include "tools/mayascene/Completions.h"

namespace mayascene {
namespace {

std::string inQuotes(std::string_view text) {
  std::string out = "'";
  for (const char c : text) {
    if (c == '\'' || c == '\\') out += '\\';
    out += c == '\n' ? ' ' : c;
  }
  return out + '\'';
}

std::string joined(const std::vector<std::string>& words) {
  std::string text;
  for (const std::string& word : words) text += (text.empty() ? "" : " ") + word;
  return text;
}

// True where the verbs of the command are typed, and none of those below it.
std::string conditionOf(const CommandTable& table) {
  std::string text;
  const auto add = [&](const std::string& part) { text += (text.empty() ? "" : "; and ") + part; };
  for (std::size_t at = table.command.find(' '); at != std::string::npos;) {
    const std::size_t next = table.command.find(' ', at + 1);
    add("__fish_seen_subcommand_from " + table.command.substr(at + 1, next - at - 1));
    at = next;
  }
  std::string below;
  for (const CommandTable& verb : table.verbs) below += ' ' + verb.verb();
  if (!below.empty()) add("not __fish_seen_subcommand_from" + below);
  return inQuotes(text);
}

std::string optionLine(const std::string& begin, const OptionRow& row) {
  std::string line = begin;
  for (const std::string& name : row.names) {
    line += name.starts_with("--") ? " -l " + name.substr(2) : " -s " + name.substr(1);
  }
  if (!row.form.empty()) line += row.isFile() ? " -r -F" : " -x";
  if (!row.words.empty()) line += " -a " + inQuotes(joined(row.words));
  return line + " -d " + inQuotes(row.text) + '\n';
}

}  // namespace

std::string fishCompletion(const CommandTable& tool) {
  std::string text = "# fish completion for mayascene\ncomplete -c mayascene -f\n";
  for (const CommandTable* table : allTables(tool)) {
    const std::string begin = "complete -c mayascene -n " + conditionOf(*table);
    for (const CommandTable& verb : table->verbs) {
      text += begin + " -a " + verb.verb() + " -d " + inQuotes(verb.sentence) + '\n';
    }
    for (const OptionGroup& group : table->groups) {
      for (const OptionRow& row : group.options) text += optionLine(begin, row);
    }
    for (const OptionRow& row : table->positionals) {
      if (row.isFile()) text += begin + " -k -a '(__fish_complete_suffix .ma)'\n";
      if (!row.words.empty()) text += begin + " -a " + inQuotes(joined(row.words)) + '\n';
    }
  }
  return text;
}

}  // namespace mayascene
