#include "tools/mayascene/CommandRows.h"

#include <algorithm>
#include <iterator>
#include <sstream>
#include <utility>

namespace mayascene {
namespace {

struct Examples {
  std::string_view command;
  CommandExample two[2];
};

constexpr Examples kExamples[] = {
    {"mayascene",
     {{"mayascene import shot.ma", "show what an import makes of a scene"},
      {"mayascene export --bake shot.ma -o shot.glb", "write its cameras for another program"}}},
    {"mayascene import",
     {{"mayascene import shot.ma", "show the layers of a baked scene"},
      {"mayascene import --bake --json shot.json shot.ma", "bake another scene first, and write all keys"}}},
    {"mayascene bake",
     {{"mayascene bake shot.ma -o shot_baked.ma", "keys at all frames of the scene"},
      {"mayascene bake --frames 1:48 a.ma b.ma -o baked/", "two scenes, a part of their frames"}}},
    {"mayascene export",
     {{"mayascene export shot.ma -o shot.glb", "the suffix names the format"},
      {"mayascene export --bake --scale 0.01 shot.ma -o shot.usda", "bake first; centimetres to metres"}}},
    {"mayascene check",
     {{"mayascene check shot.ma", "what comes over, what does not, and why"},
      {"mayascene check --json report.json shots/", "all scenes of a folder"}}},
    {"mayascene verify",
     {{"mayascene verify shot.ma", "taken, or not taken"},
      {"mayascene verify --quiet *.ma", "the exit status alone"}}},
    {"mayascene prefs",
     {{"mayascene prefs", "show the preference"},
      {"mayascene prefs set linear-units 1", "convert distances to points from now on"}}},
    {"mayascene prefs set",
     {{"mayascene prefs set linear-units 1", "convert distances to points from now on"},
      {"mayascene prefs set linear-units 0", "take them as they stand"}}},
};

// The library describes a set of words as "{marked,all,none}".
std::vector<std::string> wordsOf(const CLI::Option& option) {
  std::vector<std::string> words;
  const std::string type = option.get_type_name();
  const std::size_t open = type.find('{'), close = type.rfind('}');
  if (open == std::string::npos || close == std::string::npos) return words;
  std::istringstream list(type.substr(open + 1, close - open - 1));
  for (std::string word; std::getline(list, word, ',');) words.push_back(word);
  return words;
}

OptionRow rowOf(const CLI::Option& option) {
  constexpr std::string_view kMore = " ...";
  OptionRow row;
  row.text = option.get_description();
  row.words = wordsOf(option);
  if (option.get_positional()) {
    row.names.push_back(option.get_name(true));
    row.repeated = option.get_expected_max() > 1;
    return row;
  }
  for (const std::string& name : option.get_snames()) row.names.push_back('-' + name);
  for (const std::string& name : option.get_lnames()) row.names.push_back("--" + name);
  row.form = option.get_option_text();
  row.repeated = row.form.ends_with(kMore);
  if (row.repeated) row.form.resize(row.form.size() - kMore.size());
  return row;
}

std::string usageOf(const CommandTable& table) {
  std::string usage = "[OPTIONS]";
  for (const OptionRow& row : table.positionals)
    usage += ' ' + row.names.front() + (row.repeated ? "..." : "");
  if (table.verbs.empty()) return usage;
  const bool alone = std::any_of(table.examples.begin(), table.examples.end(),
                                 [&](const CommandExample& one) { return one.command == table.command; });
  return usage + (alone ? " [VERB]" : " VERB");
}

std::vector<const CLI::App*> verbsOf(const CLI::App& app) {
  return app.get_subcommands([](const CLI::App*) { return true; });
}

bool isFurther(std::string_view title) {
  return title == kHostGroup || title == kRehearsalGroup || title == kLimitsGroup;
}

// All but the rows of the verbs below, of which only the commands are set.
void fill(const CLI::App& app, CommandTable* table) {
  table->sentence = app.get_description();
  table->notes = app.get_footer();
  for (const Examples& one : kExamples) {
    if (one.command == table->command) table->examples.assign(std::begin(one.two), std::end(one.two));
  }
  for (const std::string& title : app.get_groups()) {
    OptionGroup group{title, isFurther(title), {}};
    for (const CLI::Option* option : app.get_options()) {
      if (option->get_group() != title || title.empty()) continue;
      (option->get_positional() ? table->positionals : group.options).push_back(rowOf(*option));
    }
    if (!group.options.empty()) table->groups.push_back(std::move(group));
  }
  std::stable_partition(table->groups.begin(), table->groups.end(),
                        [](const OptionGroup& group) { return !group.further; });
  for (const CLI::App* verb : verbsOf(app)) {
    table->verbs.emplace_back().command = table->command + ' ' + verb->get_name();
  }
  table->usage = usageOf(*table);
}

}  // namespace

CommandTable tableOf(const CLI::App& app, const std::string& command) {
  struct Pending {
    const CLI::App* app;
    CommandTable* table;
  };
  CommandTable whole;
  whole.command = command;
  std::vector<Pending> pending = {{&app, &whole}};
  while (!pending.empty()) {
    const Pending next = pending.back();
    pending.pop_back();
    fill(*next.app, next.table);
    const std::vector<const CLI::App*> verbs = verbsOf(*next.app);
    for (std::size_t i = 0; i < verbs.size(); ++i) pending.push_back({verbs[i], &next.table->verbs[i]});
  }
  return whole;
}

}  // namespace mayascene
