// The verbs and options of the tool as plain rows. Help, man pages and completions are made from them.
#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace mayascene {

// Titles of groups of options for developers of importers and hosts. --help leaves them out.
inline constexpr std::string_view kHostGroup = "The host";
inline constexpr std::string_view kRehearsalGroup = "Rehearsing failures";
inline constexpr std::string_view kLimitsGroup = "Limits";

struct OptionRow {
  std::vector<std::string> names;  // "-q", "--quiet"; of a positional its only one, "SCENE"
  std::string form;                // what stands after it, such as "FILE"; empty for a flag
  std::string text;                // may hold line breaks
  std::vector<std::string> words;  // the values, where these alone are taken
  bool repeated = false;

  bool isFile() const;  // whether the value is the name of a file or folder
};

struct OptionGroup {
  std::string title;
  bool further = false;  // left out by --help
  std::vector<OptionRow> options;
};

struct CommandExample {
  std::string_view command, meaning;
};

struct CommandTable {
  std::string command;  // "mayascene prefs set"
  std::string sentence;
  std::string usage;  // what stands after the command
  std::vector<CommandExample> examples;
  std::vector<OptionRow> positionals;
  std::vector<OptionGroup> groups;
  std::string notes;  // shown after the options; may be empty
  std::vector<CommandTable> verbs;

  std::string verb() const;  // the last word of the command
};

// The whole table and below it all verbs, from the declarations that the arguments are parsed by.
CommandTable commandTable();

// Every table, this one first.
std::vector<const CommandTable*> allTables(const CommandTable& table);

// The lines of a text.
std::vector<std::string> linesOf(std::string_view text);

}  // namespace mayascene
