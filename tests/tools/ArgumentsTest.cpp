#include "tools/mayascene/Arguments.h"

#include <gtest/gtest.h>

#include <initializer_list>
#include <sstream>
#include <string>
#include <vector>

namespace mayascene {
namespace {

struct Parsed {
  Arguments arguments;
  std::string out, err;
};

Parsed parsed(std::vector<const char*> words) {
  words.insert(words.begin(), "mayascene");
  std::ostringstream out, err;
  Parsed result;
  result.arguments = parseArguments(static_cast<int>(words.size()), words.data(), out, err);
  result.out = out.str();
  result.err = err.str();
  return result;
}

void expectWrongUsage(std::vector<const char*> words, const std::string& complaint) {
  const Parsed result = parsed(words);
  EXPECT_EQ(result.arguments.over, ExitStatus::WrongUsage) << complaint;
  EXPECT_FALSE(result.arguments.import || result.arguments.verify || result.arguments.prefs) << complaint;
  EXPECT_EQ(result.out, "");
  EXPECT_NE(result.err.find(complaint), std::string::npos) << result.err;
}

using Words = std::vector<std::string>;

TEST(Arguments, ImportTakesAnyNumberOfScenesAndNothingElseByDefault) {
  const Parsed result = parsed({"import", "a.ma", "b.ma", "verify"});
  ASSERT_TRUE(result.arguments.import);
  const ImportArguments& import = *result.arguments.import;
  EXPECT_EQ(import.scenes, (Words{"a.ma", "b.ma", "verify"}));
  EXPECT_EQ(import.json + import.host.trace + import.host.module + import.host.preferences, "");
  EXPECT_FALSE(import.quiet || import.host.permissive || import.host.linearUnits || import.host.during);
  EXPECT_FALSE(import.host.mostLayers || import.host.mostKeys || import.host.mostMemory);
  EXPECT_EQ(import.host.pluginId, 1);
  EXPECT_EQ(import.host.zoomKeys, 0);
}

TEST(Arguments, EveryOptionReachesItsPlace) {
  const Parsed result = parsed({"import",
                                "--json",
                                "j",
                                "--quiet",
                                "--trace",
                                "t",
                                "--plugin-id",
                                "7",
                                "--preferences",
                                "p",
                                "--linear-units",
                                "1",
                                "--translations",
                                "l",
                                "--module",
                                "m",
                                "--zoom-keys",
                                "3",
                                "--permissive",
                                "--most-layers",
                                "11",
                                "--most-keys",
                                "12",
                                "--most-memory",
                                "13000000000",
                                "--during",
                                "death",
                                "--fail",
                                "ShowMessage:2=-5",
                                "--fail-at",
                                "4+=6",
                                "--throw",
                                "FileRead:0=bad_alloc",
                                "--throw-at",
                                "9=runtime_error",
                                "--refuse",
                                "QZGP Comp Suite:21",
                                "a.ma"});
  ASSERT_TRUE(result.arguments.import) << result.err;
  const ImportArguments& import = *result.arguments.import;
  const HostArguments& host = import.host;
  EXPECT_EQ(import.json, "j");
  EXPECT_TRUE(import.quiet);
  EXPECT_EQ(host.trace + host.preferences + host.translations + host.module, "tplm");
  EXPECT_EQ(host.pluginId, 7);
  EXPECT_EQ(host.linearUnits, 1);
  EXPECT_EQ(host.zoomKeys, 3);
  EXPECT_TRUE(host.permissive);
  EXPECT_EQ(host.mostLayers, 11);
  EXPECT_EQ(host.mostKeys, 12);
  EXPECT_EQ(host.mostMemory, 13'000'000'000);
  EXPECT_EQ(host.during, refhost::Callback::Death);
  ASSERT_EQ(host.failures.size(), 4u);
  EXPECT_EQ(host.failures[0].operation, "ShowMessage");
  EXPECT_EQ(host.failures[0].nth, 2);
  EXPECT_EQ(host.failures[0].code, -5);
  EXPECT_EQ(host.failures[1].nth, 4);
  EXPECT_TRUE(host.failures[1].onwards);
  EXPECT_EQ(host.failures[2].kind, refhost::Failure::Kind::BadAlloc);
  EXPECT_EQ(host.failures[3].kind, refhost::Failure::Kind::RuntimeError);
  ASSERT_EQ(host.refusedSuites.size(), 1u);
  EXPECT_EQ(host.refusedSuites[0].name, "QZGP Comp Suite");
  EXPECT_EQ(host.refusedSuites[0].version, 21);
  EXPECT_EQ(import.scenes, Words{"a.ma"});
}

TEST(Arguments, RehearsalOptionsAreRepeatedAndTakeOneWordEach) {
  const Parsed result =
      parsed({"import", "--fail", "FileRead:1=2", "--fail", "FileOpen:1=3", "a.ma", "b.ma"});
  ASSERT_TRUE(result.arguments.import) << result.err;
  EXPECT_EQ(result.arguments.import->host.failures.size(), 2u);
  EXPECT_EQ(result.arguments.import->scenes, (Words{"a.ma", "b.ma"}));
}

TEST(Arguments, VerifyTakesTheHostsOptions) {
  const Parsed result = parsed({"verify", "--trace", "-", "--during", "verify", "a.ma"});
  ASSERT_TRUE(result.arguments.verify) << result.err;
  EXPECT_EQ(result.arguments.verify->host.trace, "-");
  EXPECT_EQ(result.arguments.verify->host.during, refhost::Callback::Verify);
}

TEST(Arguments, PrefsShowsOrSets) {
  EXPECT_FALSE(parsed({"prefs"}).arguments.prefs->linearUnits);
  EXPECT_EQ(parsed({"prefs", "set", "linear-units", "1"}).arguments.prefs->linearUnits, 1);
  EXPECT_EQ(parsed({"prefs", "set", "linear-units", "0"}).arguments.prefs->linearUnits, 0);
  EXPECT_EQ(parsed({"prefs", "--preferences", "p"}).arguments.prefs->preferences, "p");
  EXPECT_EQ(parsed({"prefs", "set", "linear-units", "0", "--preferences", "p"}).arguments.prefs->preferences,
            "p");
}

TEST(Arguments, ABracketedFileNameIsOneName) {
  EXPECT_EQ(parsed({"import", "[a,b]"}).arguments.import->scenes, Words{"./[a,b]"});
  EXPECT_EQ(parsed({"import", "--", "-a.ma"}).arguments.import->scenes, Words{"-a.ma"});
}

TEST(Arguments, WhatMakesNoSenseIsWrongUsage) {
  expectWrongUsage({}, "A subcommand is required");
  expectWrongUsage({"import"}, "SCENE is required");
  expectWrongUsage({"verify"}, "SCENE is required");
  expectWrongUsage({"render", "a.ma"}, "A subcommand is required");
  expectWrongUsage({"export", "a.ma"}, "--output is required");
  expectWrongUsage({"import", "--unknown", "a.ma"}, "--unknown");
  expectWrongUsage({"import", "a.ma", "--json"}, "--json");
  expectWrongUsage({"import", "a.ma", "--json", "x", "--json", "y"}, "--json");
  expectWrongUsage({"import", "a.ma", "--json", ""}, "empty");
  expectWrongUsage({"import", "--plugin-id", "seven", "a.ma"}, "--plugin-id");
  expectWrongUsage({"import", "--linear-units", "4294967296", "a.ma"}, "--linear-units");
  expectWrongUsage({"import", "--zoom-keys", "-1", "a.ma"}, "--zoom-keys");
  expectWrongUsage({"import", "--during", "lunch", "a.ma"}, "--during");
  expectWrongUsage({"verify", "--json", "x", "a.ma"}, "--json");
  expectWrongUsage({"prefs", "set", "linear-units", "2"}, "VALUE");
  expectWrongUsage({"prefs", "set", "angle-units", "1"}, "NAME");
  expectWrongUsage({"prefs", "set", "linear-units"}, "VALUE is required");
}

TEST(Arguments, WrongUsageNamesTheHelpOfItsVerb) {
  for (const std::string verb : {"import", "bake", "export", "check", "verify"}) {
    expectWrongUsage({verb.c_str(), "--nothing"},
                     "\nRun mayascene " + verb + " --help for how it is used.\n");
  }
  expectWrongUsage({"export", "a.ma", "-o", "a"}, "\nRun mayascene export --help ");
  expectWrongUsage({"prefs", "x"}, "\nRun mayascene prefs --help ");
  expectWrongUsage({"prefs", "set", "x", "1"}, "\nRun mayascene prefs set --help ");
  expectWrongUsage({"nothing"}, "\nRun mayascene --help ");
}

TEST(Arguments, AnOptionThatIsGivenTwiceIsNamedAndOneThatMayBeIsNot) {
  expectWrongUsage({"export", "a.ma", "b.ma", "--camera", "c", "--camera", "d", "--frames", "1:2", "--frames",
                    "3:4", "-o", "x"},
                   "mayascene: --frames is given twice\n");
  expectWrongUsage({"bake", "a.ma", "-o", "x", "-o", "y", "--output", "z"},
                   "mayascene: --output is given 3 times\n");
  expectWrongUsage({"check", "a.ma", "--only", "MA0101", "--only", "MA0102", "--jobs", "1", "--jobs", "1"},
                   "mayascene: --jobs is given twice\n");
  expectWrongUsage({"prefs", "--preferences", "a", "--preferences", "b", "set", "linear-units", "1"},
                   "mayascene: --preferences is given twice\n");
}

TEST(Arguments, ARehearsalThatNamesNothingIsWrongUsage) {
  expectWrongUsage({"import", "--fail", "NoSuchCall:1=2", "a.ma"}, "--fail: ");
  expectWrongUsage({"import", "--fail", "FileRead", "a.ma"}, "--fail: ");
  expectWrongUsage({"import", "--fail-at", "0=2", "a.ma"}, "--fail-at: ");
  expectWrongUsage({"import", "--throw", "FileRead:1=7", "a.ma"}, "--throw: ");
  expectWrongUsage({"import", "--throw-at", "1=logic_error", "a.ma"}, "--throw-at: ");
  expectWrongUsage({"import", "--refuse", "QZGP Comp Suite", "a.ma"}, "--refuse: ");
}

TEST(Arguments, OutputsThatWouldMixOrOverwriteAreWrongUsage) {
  expectWrongUsage({"import", "--json", "-", "--trace", "-", "a.ma"}, "only one output");
  expectWrongUsage({"import", "--json", "x", "--trace", "./x", "a.ma"}, "two files");
  expectWrongUsage({"import", "--json", "./a.ma", "a.ma"}, "overwritten");
  expectWrongUsage({"verify", "--trace", "a.ma", "a.ma"}, "overwritten");
  EXPECT_TRUE(parsed({"import", "--json", "/dev/null", "--trace", "/dev/null", "a.ma"}).arguments.import);
}

TEST(Arguments, ComplaintsShowNoControlCharacters) {
  EXPECT_EQ(parsed({"import", "--\x1b[31m", "a.ma"}).err.find('\x1b'), std::string::npos);
}

TEST(Arguments, HelpAndVersionGoToStandardOutput) {
  for (const char* word : {"--help", "--version"}) {
    const Parsed result = parsed({word});
    EXPECT_EQ(result.arguments.over, ExitStatus::Done);
    EXPECT_NE(result.out, "");
    EXPECT_EQ(result.err, "");
  }
  EXPECT_EQ(parsed({"--version"}).out, "mayascene 1.0.0\n");
}

// What a line of the help begins with, after its blanks.
bool hasLine(const std::string& help, const std::string& begin) {
  return help.find("\n  " + begin) != std::string::npos;
}

TEST(Arguments, HelpBeginsWithTwoExamplesAndHelpAllHasTheDevelopersOptionsToo) {
  for (const char* verb : {"import", "bake", "export", "check", "verify", "prefs"}) {
    const std::string help = parsed({verb, "--help"}).out, all = parsed({verb, "--help-all"}).out;
    const std::string example = std::string("  mayascene ") + verb;
    EXPECT_EQ(help.find("Examples:\n" + example), 0u) << help;
    const std::size_t second = help.find('\n' + example, 12);
    EXPECT_EQ(help.find("\n\n"), help.find('\n', second + 1)) << help;
    const bool imports = all.find("  --fail-at K[+]=CODE ...") != std::string::npos;
    EXPECT_EQ(imports, std::string("import verify").find(verb) != std::string::npos);
    EXPECT_EQ(help == all,
              help.find("mayascene " + std::string(verb) + " --help-all\n") == std::string::npos);
    for (const char* further :
         {"--trace", "--fail ", "--throw-at", "--during", "--most-keys", "--permissive"})
      EXPECT_FALSE(hasLine(help, further)) << verb << further;
  }
  for (const char* usual : {"--json FILE", "--bake", "--frames A:B", "-q,--quiet", "--linear-units N"})
    EXPECT_TRUE(hasLine(parsed({"import", "--help"}).out, usual)) << usual;
  EXPECT_TRUE(hasLine(parsed({"export", "--help-all"}).out, "--most-keys N"));
  EXPECT_NE(parsed({"prefs", "set", "--help"}).out.find("Usage: mayascene prefs set "), std::string::npos);
}

TEST(Arguments, HelpShowsNoOptionOfTheChildProcesses) {
  const std::string all = parsed({"check", "--help-all"}).out;
  EXPECT_EQ(all.find("--child"), std::string::npos);
  EXPECT_EQ(all.find("--colour"), std::string::npos);
}

TEST(Arguments, CodesAreTakenInAnyCaseAndOthersAreWrongUsage) {
  const Parsed result = parsed({"check", "--only", "ma0701", "--only", "MA0711", "a.ma"});
  ASSERT_TRUE(result.arguments.check) << result.err;
  EXPECT_EQ(result.arguments.check->options.only.size(), 2u);
  expectWrongUsage({"check", "--only", "MA9999", "a.ma"}, "mayascene: --only: MA9999: no such code\n");
}

}  // namespace
}  // namespace mayascene
