#include "tools/mayascene/Arguments.h"

#include <CLI/CLI.hpp>
#include <algorithm>
#include <filesystem>
#include <optional>
#include <string>
#include <string_view>
#include <system_error>

#include "tools/mayascene/BakeWords.h"
#include "tools/mayascene/CommandRows.h"
#include "tools/mayascene/ExportWords.h"
#include "tools/mayascene/HelpText.h"
#include "tools/mayascene/HostWords.h"
#include "tools/mayascene/Interruption.h"
#include "tools/mayascene/OutputFile.h"
#include "tools/mayascene/TerminalText.h"
#include "tools/mayascene/Version.h"

namespace mayascene {
namespace {

constexpr double kLeastTimeout = 0.001;
constexpr double kMostTimeout = 1e6;

constexpr const char* kImportedScene =
    "a Maya ASCII scene with baked animation; with --bake\nanimated in any way";

// The library's own range takes "nan" for a number in it.
CLI::Validator timeoutWord() {
  const auto check = [](const std::string& word) -> std::string {
    double seconds = 0.0;
    const bool taken =
        CLI::detail::lexical_cast(word, seconds) && seconds >= kLeastTimeout && seconds <= kMostTimeout;
    return taken ? "" : word + " is not a number of seconds between 0.001 and 1000000";
  };
  return CLI::Validator(check, "");
}

// "MA0701", in capitals or not; null where there is none.
const diag::Entry* entryOf(const std::string& word) {
  for (const diag::Entry& entry : diag::Table()) {
    if (CLI::detail::to_lower(diag::NameOf(entry.code)) == CLI::detail::to_lower(word)) return &entry;
  }
  return nullptr;
}

// Takes the codes. Its description lists all of them, as that of the library's own set of words does; its
// complaint lists none.
CLI::Validator codeWord() {
  std::string all;
  for (const diag::Entry& entry : diag::Table()) all += (all.empty() ? "{" : ",") + diag::NameOf(entry.code);
  const auto check = [](const std::string& word) { return entryOf(word) ? "" : word + ": no such code"; };
  return CLI::Validator(check, all + '}');
}

bool sameFile(const std::string& a, const std::string& b) {
  std::error_code ignored;
  return std::filesystem::path(a).lexically_normal() == std::filesystem::path(b).lexically_normal() ||
         std::filesystem::equivalent(a, b, ignored);
}

struct NamedOutput {
  std::string option;
  std::string target;  // empty: none
};

void checkPair(const NamedOutput& a, const NamedOutput& b) {
  std::error_code ignored;
  if (a.target.empty() || b.target.empty()) return;
  const std::string both = a.option + " and " + b.option;
  if (a.target == kStandardOutput && b.target == kStandardOutput) {
    throw CLI::ValidationError(both, "only one output can go to standard output");
  }
  if (sameFile(a.target, b.target) && !std::filesystem::is_character_file(a.target, ignored)) {
    throw CLI::ValidationError(both, "the two outputs need two files");
  }
}

// An output that would be written over another one, over a scene, or into the middle of another one.
void checkOutputs(const std::vector<NamedOutput>& outputs, const std::vector<std::string>& scenes) {
  for (std::size_t i = 0; i < outputs.size(); ++i) {
    for (std::size_t j = i + 1; j < outputs.size(); ++j) checkPair(outputs[i], outputs[j]);
    const std::string& output = outputs[i].target;
    if (output.empty() || output == kStandardOutput) continue;
    for (const std::string& scene : scenes) {
      if (!sameFile(output, scene)) continue;
      throw CLI::ValidationError("output", output + " is one of the scenes and would be overwritten");
    }
  }
}

// No option takes an empty value.
void refuseEmptyValues(const CLI::App& verb) {
  for (const CLI::Option* option : verb.get_options()) {
    for (const std::string& value : option->results()) {
      if (value.empty()) throw CLI::ValidationError(option->get_name(), "an empty value");
    }
  }
}

// The command line library takes "[a,b]" as a list of two; here it is the name of a file.
std::vector<std::string> wordsOf(int argc, const char* const* argv) {
  std::vector<std::string> words(argv + std::min(argc, 1), argv + argc);
  for (std::string& word : words) {
    if (word.size() > 1 && word.front() == '[' && word.back() == ']') word.insert(0, "./");
  }
  std::reverse(words.begin(), words.end());  // the order in which the library takes them
  return words;
}

// The whole command line, and where its parts go.
struct CommandLine {
  CLI::App app{"Imports the cameras of Maya ASCII scenes; shows, bakes, checks and exports them.",
               "mayascene"};
  ImportArguments import;
  VerifyArguments verify;
  PrefsArguments prefs;
  BakeArguments bake;
  CheckArguments check;
  ExportArguments exported;
  ExportWords exportWords;
  std::vector<std::string> onlyCodes;
  HostWords importHostWords, verifyHostWords;
  BakeWords importBakeWords, bakeWords;
  bool importBakes = false;
  std::string preferenceName, preferenceValue;
  CLI::App* importVerb = nullptr;
  CLI::App* verifyVerb = nullptr;
  CLI::App* prefsVerb = nullptr;
  CLI::App* bakeVerb = nullptr;
  CLI::App* checkVerb = nullptr;
  CLI::App* exportVerb = nullptr;
  CLI::App* setVerb = nullptr;

  CommandLine() {
    app.set_version_flag("--version", std::string("mayascene ") + kVersion, "show the version and leave");
    app.set_help_flag("-h,--help", "show the usual options and leave");
    app.set_help_all_flag("--help-all", "show all options and leave");
    app.require_subcommand(1);
    addImport();
    addBake();
    addExport();
    addCheck();
    addVerify();
    addPrefs();
  }

  static void addScenes(CLI::App* verb, std::vector<std::string>* scenes, const char* text) {
    verb->add_option("SCENE", *scenes, text)->required()->option_text(" ");
  }

  void addImport() {
    importVerb = app.add_subcommand("import", "import scenes and print an outline of what was made");
    addScenes(importVerb, &import.scenes, kImportedScene);
    importVerb->add_option("--json", import.json, "write all of it, keys included; - is standard output")
        ->option_text("FILE");
    importVerb->add_flag("-v,--verbose", import.verbose, "show every property in the outline");
    importVerb->add_flag("-q,--quiet", import.quiet, "print nothing but errors");
    importVerb->add_flag("--bake", importBakes, "bake each scene first: see mayascene bake");
    addHostOptions(importVerb, &import.host, &importHostWords);
    addLimits(importVerb, &import.host);
    addBakeOptions(importVerb, &importBakeWords, "With --bake");
  }

  void addBake() {
    bakeVerb = app.add_subcommand("bake", "write scenes anew, with a value at every frame");
    addScenes(bakeVerb, &bake.scenes, "a Maya ASCII scene, animated in any way");
    bakeVerb->add_option("-o,--output", bake.output, "the bake; with several scenes a folder for them")
        ->required()
        ->option_text("OUT");
    bakeVerb->add_flag("-q,--quiet", bake.quiet, "print nothing but errors");
    addBakeOptions(bakeVerb, &bakeWords, "");
  }

  void addExport() {
    exportVerb = app.add_subcommand("export", "write cameras and nulls of scenes for other programs");
    addScenes(exportVerb, &exported.scenes, kImportedScene);
    addExportOptions(exportVerb, &exportWords, &exported);
  }

  void addCheck() {
    checkVerb = app.add_subcommand("check", "report what comes over from scenes, what does not, and why");
    addScenes(checkVerb, &check.scenes,
              "a Maya ASCII scene, in whatever state, or a folder\nthat is searched for *.ma");
    checkVerb->add_option("--json", check.json, "write the reports; - is standard output")
        ->option_text("FILE");
    checkVerb->add_flag("--strict", check.strict, "warnings make the exit status 1");
    checkVerb->add_option("--only", onlyCodes, "this code alone, such as MA0701")
        ->allow_extra_args(false)
        ->option_text("CODE ...")
        ->check(codeWord());
    checkVerb->add_flag("--all", check.options.all,
                        "show the whole head and all diagnostics, not 20 of each code");
    checkVerb->add_flag("-v,--verbose", check.verbose, "a line for each scene on standard error");
    checkVerb->add_flag("-q,--quiet", check.quiet, "print nothing but errors");
    checkVerb->add_option("--jobs", check.jobs, "scenes that are checked at a time (the processors)")
        ->option_text("N")
        ->check(CLI::Range(std::size_t{1}, kMostChildren));
    checkVerb->add_option("--timeout", check.timeout, "seconds that each scene may take (60)")
        ->option_text("S")
        ->check(timeoutWord());
    addUnits(checkVerb, &check.host);
    addChildOptions();
  }

  // Options that the tool gives to its own child processes. No help shows them.
  void addChildOptions() {
    checkVerb->add_flag("--child", check.child)->group("");
    checkVerb->add_flag("--two-threads", check.twoThreads)->group("");
    checkVerb->add_flag("--colour-report", check.colourReport)->group("");
    checkVerb->add_flag("--colour-complaints", check.colourComplaints)->group("");
  }

  void addVerify() {
    verifyVerb = app.add_subcommand("verify", "show for each file whether the importer takes it");
    addScenes(verifyVerb, &verify.scenes, "a file, such as a Maya ASCII scene");
    verifyVerb->add_flag("-q,--quiet", verify.quiet, "print nothing but errors");
    addHostOptions(verifyVerb, &verify.host, &verifyHostWords);
  }

  void addPrefs() {
    prefsVerb = app.add_subcommand("prefs", "show the preference, or set it");
    addPreferences(prefsVerb, &prefs.preferences);
    setVerb = prefsVerb->add_subcommand("set", "set a preference");
    setVerb->fallthrough();
    setVerb->add_option("NAME", preferenceName, "linear-units")
        ->required()
        ->option_text(" ")
        ->check(CLI::IsMember({"linear-units"}));
    setVerb
        ->add_option("VALUE", preferenceValue,
                     "1 converts distances from the scene's linear unit, 0 does not")
        ->required()
        ->option_text(" ")
        ->check(CLI::IsMember({"0", "1"}));
  }

  void translateImportBake() {
    const std::vector<std::string> given = givenBakeOptions(*importVerb);
    if (!importBakes && !given.empty()) {
      throw CLI::ValidationError(given.front(), "needs --bake");
    }
    if (importBakes) translateBakeWords(importBakeWords, &import.bake.emplace());
  }

  // The command that was typed, as far as its verbs go.
  CommandTable named() const {
    const CLI::App* verb = &app;
    std::string command = app.get_name();
    while (!verb->get_subcommands().empty()) {
      verb = verb->get_subcommands().back();
      command += ' ' + verb->get_name();
    }
    return tableOf(*verb, command);
  }

  // What is wrong with the command line, in plain words.
  std::string complaint(const CLI::ParseError& wrong) const {
    const bool mismatch = dynamic_cast<const CLI::ArgumentMismatch*>(&wrong) != nullptr;
    for (const CLI::App* verb = &app; mismatch; verb = verb->get_subcommands().back()) {
      for (const CLI::Option* option : verb->get_options()) {
        if (option->get_items_expected_max() != 1 || option->results().size() < 2) continue;
        const std::size_t times = option->results().size();
        return option->get_name() + " is given " +
               (times == 2 ? std::string("twice") : std::to_string(times) + " times");
      }
      if (verb->get_subcommands().empty()) break;
    }
    return wrong.what();
  }

  Arguments parse(std::vector<std::string> words) {
    app.parse(std::move(words));
    for (const CLI::App* verb : {importVerb, bakeVerb, exportVerb, checkVerb, verifyVerb, prefsVerb, setVerb})
      refuseEmptyValues(*verb);
    Arguments arguments;
    if (importVerb->parsed()) {
      translateHostWords(importHostWords, &import.host);
      translateImportBake();
      checkOutputs({{"--json", import.json},
                    {"--trace", import.host.trace},
                    {"--report", import.bake ? import.bake->report : ""}},
                   import.scenes);
      arguments.import = import;
    } else if (bakeVerb->parsed()) {
      translateBakeWords(bakeWords, &bake);
      checkOutputs({{"--output", bake.output}, {"--report", bake.report}}, bake.scenes);
      arguments.bake = bake;
    } else if (exportVerb->parsed()) {
      translateExportWords(*exportVerb, exportWords, &exported);
      checkOutputs({{"--output", exported.output}, {"--report", exported.bake ? exported.bake->report : ""}},
                   exported.scenes);
      arguments.exported = exported;
    } else if (checkVerb->parsed()) {
      for (const std::string& word : onlyCodes) check.options.only.push_back(entryOf(word)->code);
      checkOutputs({{"--json", check.json}}, check.scenes);
      arguments.check = check;
    } else if (verifyVerb->parsed()) {
      translateHostWords(verifyHostWords, &verify.host);
      checkOutputs({{"--trace", verify.host.trace}}, verify.scenes);
      arguments.verify = verify;
    } else {
      if (setVerb->parsed()) prefs.linearUnits = preferenceValue == "1" ? 1 : 0;
      arguments.prefs = prefs;
    }
    return arguments;
  }
};

}  // namespace

CommandTable commandTable() {
  const CommandLine line;
  return tableOf(line.app, line.app.get_name());
}

Arguments parseArguments(int argc, const char* const* argv, std::ostream& out, std::ostream& err) {
  CommandLine line;
  try {
    return line.parse(wordsOf(argc, argv));
  } catch (const CLI::CallForHelp&) {
    out << helpText(line.named(), false);
    return {};
  } catch (const CLI::CallForAllHelp&) {
    out << helpText(line.named(), true);
    return {};
  } catch (const CLI::Success& shown) {
    line.app.exit(shown, out, err);
    return {};
  } catch (const CLI::ParseError& wrong) {
    err << "mayascene: " << terminalText(line.complaint(wrong)) << "\nRun " << line.named().command
        << " --help for how it is used.\n";
    Arguments arguments;
    arguments.over = ExitStatus::WrongUsage;
    return arguments;
  }
}

}  // namespace mayascene
