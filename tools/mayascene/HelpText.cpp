#include "tools/mayascene/HelpText.h"

#include <algorithm>
#include <string_view>

#include "tools/mayascene/ExitStatus.h"

namespace mayascene {
namespace {

constexpr std::size_t kColumn = 36;
constexpr std::size_t kWidth = 100;

// The text in lines of at most kWidth. All lines but the first begin with `indent` blanks.
std::string wrapped(std::string_view text, std::size_t indent) {
  std::string lines;
  while (indent + text.size() > kWidth) {
    const std::size_t blank = text.rfind(' ', kWidth - indent);
    lines.append(text.substr(0, blank)).append("\n").append(indent, ' ');
    text.remove_prefix(blank + 1);
  }
  return lines.append(text);
}

std::string exitStatuses() {
  constexpr std::size_t kIndent = 5;
  std::string text = "Exit status:\n";
  for (const ExitMeaning& row : kExitMeanings) {
    text += "  " + std::to_string(static_cast<int>(row.status)) + "  " + wrapped(row.meaning, kIndent) + '\n';
  }
  return text + wrapped(std::string(kExitRules), 0) + '\n';
}

// Two columns; a line break in the text begins a line in the second one.
std::string rowText(std::string left, std::string_view text) {
  left.insert(0, "  ");
  left.resize(std::max(left.size() + 1, kColumn), ' ');
  for (const std::string& line : linesOf(text)) {
    left += line + '\n';
    left.append(kColumn, ' ');
  }
  left.resize(left.size() - kColumn);
  return left;
}

std::string leftOf(const OptionRow& row) {
  std::string text;
  for (const std::string& name : row.names) text += (text.empty() ? "" : ",") + name;
  if (!row.form.empty()) text += ' ' + row.form;
  return row.repeated && !row.form.empty() ? text + " ..." : text;
}

std::string exampleText(const CommandTable& table) {
  std::size_t widest = 0;
  for (const CommandExample& one : table.examples) widest = std::max(widest, one.command.size());
  std::string text = "Examples:\n";
  for (const CommandExample& one : table.examples) {
    text.append("  ").append(one.command).append(widest - one.command.size() + 3, ' ');
    text.append(one.meaning).append("\n");
  }
  return text;
}

}  // namespace

std::string helpText(const CommandTable& table, bool all) {
  std::string text = exampleText(table) + '\n' + table.sentence + '\n';
  text += "Usage: " + table.command + ' ' + table.usage + '\n';
  if (!table.positionals.empty()) text += '\n';
  for (const OptionRow& row : table.positionals) text += rowText(leftOf(row), row.text);
  bool leftOut = false;
  for (const OptionGroup& group : table.groups) {
    leftOut = leftOut || (group.further && !all);
    if (group.further && !all) continue;
    text += '\n' + group.title + ":\n";
    for (const OptionRow& row : group.options) text += rowText(leftOf(row), row.text);
  }
  if (!table.verbs.empty()) text += "\nVerbs:\n";
  for (const CommandTable& verb : table.verbs) text += rowText(verb.verb(), verb.sentence);
  if (!table.notes.empty()) text += '\n' + table.notes + '\n';
  if (leftOut)
    text +=
        "\nFor developers of importers and hosts there are more options: " + table.command + " --help-all\n";
  return text + '\n' + exitStatuses();
}

}  // namespace mayascene
