#include "tools/mayascene/ManPage.h"

#include <algorithm>
#include <cctype>
#include <string_view>

#include "tools/mayascene/ExitStatus.h"
#include "tools/mayascene/Version.h"

namespace mayascene {
namespace {

// Text that the formatter prints as it is: its own signs are escaped, and no line begins a request.
std::string plain(std::string_view text) {
  std::string out;
  bool lineBegins = true;
  for (const char c : text) {
    if (lineBegins && (c == '.' || c == '\'')) out += "\\&";
    lineBegins = c == '\n';
    switch (c) {
      case '\\':
        out += "\\e";
        break;
      case '-':
        out += "\\-";
        break;
      case '"':
        out += "\\(dq";
        break;
      case '\'':
        out += "\\(aq";
        break;
      default:
        out += c;
    }
  }
  return out;
}

std::string bold(std::string_view text) { return "\\fB" + plain(text) + "\\fR"; }
std::string italic(std::string_view text) { return "\\fI" + plain(text) + "\\fR"; }

std::string section(std::string_view title) { return ".SH " + plain(title) + '\n'; }

std::string entry(const std::string& term, std::string_view text) {
  return ".TP\n" + term + '\n' + plain(text) + '\n';
}

std::string entry(const OptionRow& row) {
  std::string term;
  for (const std::string& name : row.names) term += (term.empty() ? "" : ", ") + bold(name);
  if (!row.form.empty()) term += ' ' + italic(row.form);
  std::string text = row.text;
  if (row.repeated) text += "; can be given several times";
  if (!row.words.empty() && row.words.size() <= 12) {
    std::string words;
    for (const std::string& word : row.words) words += (words.empty() ? "" : ", ") + word;
    return entry(term, text) + ".br\nOne of: " + plain(words) + '\n';
  }
  return entry(term, text);
}

std::string exitStatuses() {
  std::string text = section("EXIT STATUS");
  for (const ExitMeaning& row : kExitMeanings) {
    text += entry(bold(std::to_string(static_cast<int>(row.status))), row.meaning);
  }
  return text + ".PP\n" + plain(kExitRules) + '\n';
}

std::string seeAlso(const CommandTable& table, const CommandTable& tool) {
  std::string text;
  for (const CommandTable* other : allTables(tool)) {
    if (other->command == table.command) continue;
    text += (text.empty() ? "" : ",\n") + bold(manPageName(*other)) + "(1)";
  }
  return section("SEE ALSO") + text + '\n';
}

}  // namespace

std::string manPageName(const CommandTable& table) {
  std::string name = table.command;
  std::replace(name.begin(), name.end(), ' ', '-');
  return name;
}

std::string manPage(const CommandTable& table, const CommandTable& tool) {
  std::string title = manPageName(table);
  for (char& c : title) c = static_cast<char>(std::toupper(static_cast<unsigned char>(c)));
  std::string page = ".TH " + plain(title) + " 1 \"\" \"mayascene " + kVersion + "\"\n";
  page += section("NAME") + plain(manPageName(table)) + " \\- " + plain(table.sentence) + '\n';
  page += section("SYNOPSIS") + bold(table.command) + ' ' + plain(table.usage) + '\n';
  if (!table.verbs.empty()) page += section("VERBS");
  for (const CommandTable& verb : table.verbs) page += entry(bold(verb.verb()), verb.sentence);
  page += section("OPTIONS");
  for (const OptionRow& row : table.positionals) page += entry(row);
  for (const OptionGroup& group : table.groups) {
    if (&group != &table.groups.front()) page += ".SS " + plain(group.title) + '\n';
    for (const OptionRow& row : group.options) page += entry(row);
  }
  if (!table.notes.empty()) page += section("NOTES") + ".nf\n" + plain(table.notes) + "\n.fi\n";
  page += section("EXAMPLES");
  for (const CommandExample& one : table.examples) page += entry(bold(one.command), one.meaning);
  return page + exitStatuses() + seeAlso(table, tool);
}

}  // namespace mayascene
