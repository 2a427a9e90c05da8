// Every option that `import` and `verify` hand to the embedded host, by its effect.
#include <gtest/gtest.h>

#include <nlohmann/json.hpp>
#include <sstream>
#include <string>
#include <vector>

#include "tests/tools/ToolRun.h"

namespace mayascene_test {
namespace {

using nlohmann::json;

bool contains(const std::string& text, const std::string& part) {
  return text.find(part) != std::string::npos;
}

class HostOptions : public ToolTest {
 protected:
  HostOptions() {
    write("still.ma", sceneText(stillCamera()));
    write("crane.ma", sceneText(craneCamera()));
    write("notes.txt", "just some notes\n");
  }

  ToolResult import(std::vector<std::string> further) const {
    further.insert(further.begin(), "import");
    return run(further);
  }

  // The lines of the trace that an import writes with these arguments.
  std::vector<json> traceOf(std::vector<std::string> further) const {
    further.insert(further.end(), {"--trace", "-"});
    std::vector<json> lines;
    std::istringstream text(import(further).out);
    for (std::string line; std::getline(text, line);) lines.push_back(json::parse(line));
    return lines;
  }

  json firstCall(const std::vector<json>& trace, const std::string& call) const {
    for (const json& line : trace) {
      if (line["call"] == call) return line;
    }
    return nullptr;
  }
};

TEST_F(HostOptions, TheTraceBracketsEveryCallback) {
  std::string brackets;
  for (const json& line : traceOf({"still.ma", "still.ma"})) {
    if (line.contains("callback")) {
      brackets += line["call"].get<std::string>() + ' ' + line["callback"].get<std::string>() + '\n';
    }
  }
  EXPECT_EQ(brackets,
            "enter GPMain_MayaImport\nleave GPMain_MayaImport\n"
            "enter ImportFileCallback\nleave ImportFileCallback\n"
            "enter ImportFileCallback\nleave ImportFileCallback\n"
            "enter DeathHook\nleave DeathHook\n");
}

TEST_F(HostOptions, TheTraceToAFileIsTheSameAndLeavesTheOutlineAlone) {
  const ToolResult toFile = import({"still.ma", "--trace", "calls.jsonl"});
  EXPECT_EQ(toFile.status, 0);
  EXPECT_EQ(toFile.out.find("still.ma: 1 composition"), 0u);
  EXPECT_EQ(read("calls.jsonl"), import({"still.ma", "--trace", "-"}).out);
}

TEST_F(HostOptions, ThePluginIdIsGivenToThePlugin) {
  EXPECT_EQ(firstCall(traceOf({"still.ma"}), "NewMemHandle")["pluginId"], 1);
  EXPECT_EQ(firstCall(traceOf({"still.ma", "--plugin-id", "7"}), "NewMemHandle")["pluginId"], 7);
}

TEST_F(HostOptions, LinearUnitsConvertDistancesForThisRunOnly) {
  EXPECT_TRUE(contains(import({"-v", "still.ma", "--linear-units", "1"}).out,
                       "position           42.52, -56.693, -85.039 pt"));
  EXPECT_TRUE(contains(import({"-v", "still.ma"}).out, "position           1.5, -2, -3 pt"));
  EXPECT_TRUE(
      contains(import({"-v", "still.ma", "--linear-units", "0"}).out, "position           1.5, -2, -3 pt"));
}

TEST_F(HostOptions, TheStoredPreferenceHoldsWithoutTheOption) {
  ASSERT_EQ(run({"prefs", "set", "linear-units", "1", "--preferences", "store"}).status, 0);
  EXPECT_TRUE(
      contains(import({"-v", "still.ma", "--preferences", "store"}).out, "42.52, -56.693, -85.039 pt"));
  EXPECT_TRUE(contains(import({"-v", "still.ma", "--preferences", "store", "--linear-units", "0"}).out,
                       "1.5, -2, -3 pt"));
}

TEST_F(HostOptions, ThePreferenceStoreIsMadeWhenMissingAndLeftAloneAfterwards) {
  ASSERT_EQ(import({"still.ma", "--preferences", "store"}).status, 0);
  EXPECT_EQ(read("store"), "[Maya Camera]\nUse Linear Units=0\n");
  write("store", "[Maya Camera]\nUse Linear Units=0\nSomebody Else's=3\nand no entry\n");
  ASSERT_EQ(import({"still.ma", "--preferences", "store", "--linear-units", "1"}).status, 0);
  EXPECT_EQ(read("store"), "[Maya Camera]\nUse Linear Units=0\nSomebody Else's=3\nand no entry\n");
}

TEST_F(HostOptions, AStoreThatCannotBeWrittenChangesNothing) {
  const ToolResult result = import({"still.ma", "--quiet", "--preferences", "still.ma/store"});
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.err, "");
}

TEST_F(HostOptions, TranslationsReplaceTheMessages) {
  write("words.txt", "# what the user sees\n\n$$$/QZ/Maya_Import/LStr/0001=Nur gebackene Szenen.\n");
  EXPECT_TRUE(contains(import({"notes.txt", "--translations", "words.txt"}).out,
                       "messages\n  Nur gebackene Szenen.\n"));
}

TEST_F(HostOptions, ATranslationWithoutAnEqualsSignIsReportedWithItsLine) {
  write("words.txt", "# what the user sees\nno sign\n");
  const ToolResult result = import({"still.ma", "--translations", "words.txt"});
  EXPECT_EQ(result.status, 3);
  EXPECT_TRUE(contains(result.err, "words.txt:2")) << result.err;
}

TEST_F(HostOptions, FailMakesTheNthCallFail) {
  const ToolResult result = import({"still.ma", "--fail", "SetStreamValue:2=4242"});
  EXPECT_EQ(result.status, 1);
  EXPECT_TRUE(contains(result.err, "mayascene: still.ma: error 4242: an unknown code\n")) << result.err;
  const auto trace = traceOf({"still.ma", "--fail", "SetStreamValue:2=4242"});
  std::string errors;
  for (const json& line : trace) {
    if (line["call"] == "SetStreamValue") errors += line["error"].dump() + ' ';
  }
  EXPECT_EQ(errors, "0 4242 ");
}

TEST_F(HostOptions, FailCountsAnewForEachScene) {
  const ToolResult result = import({"still.ma", "still.ma", "--fail", "CreateComp:1=3014", "--quiet"});
  std::size_t reported = 0;
  for (std::size_t at = 0; (at = result.err.find("error 3014 (BAD_VALUE)", at)) != std::string::npos; ++at)
    ++reported;
  EXPECT_EQ(reported, 2u) << result.err;
}

TEST_F(HostOptions, FailAtCountsEverySuiteCall) {
  std::vector<json> calls;
  bool within = false;
  for (const json& line : traceOf({"still.ma", "--fail-at", "5=99"})) {
    if (line.value("callback", "") == "ImportFileCallback") within = line["call"] == "enter";
    if (within && !line.contains("callback")) calls.push_back(line);
  }
  ASSERT_GE(calls.size(), 5u);
  for (std::size_t i = 0; i < calls.size(); ++i) EXPECT_EQ(calls[i]["error"], i == 4 ? 99 : 0) << i;
}

TEST_F(HostOptions, FailAtWithAPlusFailsAllAfterItToo) {
  std::size_t good = 0, failed = 0;
  bool within = false;
  for (const json& line : traceOf({"still.ma", "--fail-at", "5+=99"})) {
    if (line.value("callback", "") == "ImportFileCallback") within = line["call"] == "enter";
    if (within && !line.contains("callback")) ++(line["error"] == 99 ? failed : good);
  }
  EXPECT_EQ(good, 4u);
  EXPECT_GE(failed, 2u);
}

TEST_F(HostOptions, ThrowThrowsAStandardException) {
  const ToolResult memory = import({"still.ma", "--throw", "CreateComp:1=bad_alloc"});
  EXPECT_EQ(memory.status, 1);
  EXPECT_TRUE(contains(memory.err, "still.ma: error 2051 (EXCEPTION_MEMORY): the memory is exhausted\n"))
      << memory.err;
  const ToolResult other = import({"still.ma", "--throw", "CreateComp:1=runtime_error"});
  EXPECT_TRUE(contains(other.err, "still.ma: error 2052 (EXCEPTION_OTHER): ")) << other.err;
  EXPECT_EQ(firstCall(traceOf({"still.ma", "--throw", "CreateComp:1=bad_alloc"}), "CreateComp")["error"],
            "bad_alloc");
}

TEST_F(HostOptions, AnExceptionOfAnUnknownTypeEndsTheImportWithoutAMessageAndWhatIsOpenIsLeft) {
  const ToolResult result = import({"still.ma", "--throw", "CreateComp:1=other"});
  EXPECT_EQ(result.status, 1);
  EXPECT_TRUE(contains(result.err, "still.ma: error 2052 (EXCEPTION_OTHER): ")) << result.err;
  EXPECT_TRUE(contains(result.err, "mem:1 (file buffer, ")) << result.err;
  EXPECT_EQ(firstCall(traceOf({"still.ma", "--throw", "CreateComp:1=other"}), "CreateComp")["error"],
            "other");
  // Out of the utility library, and in every callback.
  for (const char* const service : {"ListAppend:1=other", "FileRead:1=other", "FileCreate:0=other"}) {
    const ToolResult thrown = import({"still.ma", "--throw", service});
    EXPECT_EQ(thrown.status, 1) << service;
    EXPECT_TRUE(contains(thrown.err, "error 2052 (EXCEPTION_OTHER)")) << thrown.err;
  }
  const ToolResult verified = run({"verify", "still.ma", "--throw", "FileRead:1=other"});
  EXPECT_EQ(verified.status, 1);
  EXPECT_TRUE(contains(verified.err, "error 2052 (EXCEPTION_OTHER)")) << verified.err;
  EXPECT_EQ(import({"still.ma", "--during", "entry", "--throw", "GetPrefLong:1=other"}).status, 4);
}

TEST_F(HostOptions, ThrowAtThrowsAtTheKthCall) {
  const auto trace = traceOf({"still.ma", "--throw-at", "2=runtime_error"});
  EXPECT_EQ(firstCall(trace, "NewMemHandle")["error"], "runtime_error");
}

TEST_F(HostOptions, ARefusedSuiteIsMissing) {
  const ToolResult result = import({"still.ma", "--refuse", "QZGP Comp Suite:21"});
  EXPECT_EQ(result.status, 1);
  EXPECT_TRUE(contains(result.err, "still.ma: error 13 (MISSING_SUITE): ")) << result.err;
}

TEST_F(HostOptions, ZoomKeysAreThereBeforeTheImport) {
  EXPECT_TRUE(
      contains(import({"-v", "still.ma", "--zoom-keys", "2"}).out, "zoom               (640 px)   2 keys, "));
}

TEST_F(HostOptions, PermissiveRecordsWhatIsOtherwiseRefusedInWords) {
  write("flat.ma", sceneText("\tsetAttr \".w\" 0;\n" + std::string(stillCamera())));
  const ToolResult strict = import({"flat.ma"});
  EXPECT_EQ(strict.status, 1);
  EXPECT_TRUE(contains(strict.err, "mayascene: flat.ma: the host refused: CreateComp")) << strict.err;
  EXPECT_TRUE(contains(strict.err, "flat.ma: error 3011 (BAD_SIZE): ")) << strict.err;
  const ToolResult permissive = import({"flat.ma", "--permissive"});
  EXPECT_EQ(permissive.status, 0) << permissive.err;
  EXPECT_TRUE(contains(permissive.out, "\"flat\"   0 x 360 px")) << permissive.out;
}

TEST_F(HostOptions, DuringMovesTheRehearsalToAnotherCallback) {
  const ToolResult entry = import({"still.ma", "--during", "entry", "--fail", "RegisterImporterTypes:1=88"});
  EXPECT_EQ(entry.status, 4);
  const ToolResult death = import({"still.ma", "--during", "death", "--fail", "CreateComp:1=88"});
  EXPECT_EQ(death.status, 0) << death.err;
  const ToolResult verify = run({"verify", "still.ma", "--fail", "BeginSilentErrors:1=88"});
  EXPECT_EQ(verify.status, 1);
  EXPECT_TRUE(contains(verify.err, "mayascene: still.ma: error 88: ")) << verify.err;
  const ToolResult moved =
      run({"verify", "still.ma", "--during", "import", "--fail", "BeginSilentErrors:1=88"});
  EXPECT_EQ(moved.status, 0) << moved.err;
}

TEST_F(HostOptions, WhatAFailureLeavesByDesignIsListedWithoutEffect) {
  const ToolResult result = import({"still.ma", "--fail", "ReleaseStream:3=5"});
  EXPECT_EQ(result.status, 0) << result.err;
  EXPECT_TRUE(contains(result.err, "mayascene: still.ma: kept by design: stream:3 (")) << result.err;
}

TEST_F(HostOptions, AnExceptionOutOfASuiteReleaseEndsTheProcessWithASentence) {
  const ToolResult result = import({"still.ma", "--throw", "ReleaseSuiteByName:1=bad_alloc"});
  EXPECT_EQ(result.signal, 6);
  EXPECT_TRUE(contains(result.err, "mayascene: an exception escaped where none may")) << result.err;
}

TEST_F(HostOptions, TheTraceOfARunThatAnExceptionEndsEndsWithTheCallThatThrew) {
  const std::vector<std::string> ended = {
      "import", "still.ma", "--json", "out.json", "--throw", "ReleaseSuiteByName:1=bad_alloc", "--trace"};
  std::vector<std::string> toFile = ended, toOutput = ended;
  toFile.push_back("calls.jsonl");
  toOutput.push_back("-");
  EXPECT_EQ(run(toFile).signal, 6);
  const ToolResult result = run(toOutput);
  EXPECT_EQ(result.signal, 6);
  EXPECT_EQ(read("calls.jsonl"), result.out);
  ASSERT_TRUE(result.out.ends_with('\n'));
  const std::size_t lastLine = result.out.rfind('\n', result.out.size() - 2) + 1;
  const json last = json::parse(result.out.substr(lastLine));
  EXPECT_EQ(last["call"], "ReleaseSuiteByName");
  EXPECT_EQ(last["error"], "bad_alloc");
  EXPECT_EQ(files(), (std::vector<std::string>{"calls.jsonl", "crane.ma", "notes.txt", "still.ma"}));
}

TEST_F(HostOptions, TheJsonNamesThePreferenceThatTheImporterWasHanded) {
  ASSERT_EQ(run({"prefs", "set", "linear-units", "1", "--preferences", "store"}).status, 0);
  const auto handed = [&](const std::vector<std::string>& further) {
    std::vector<std::string> words = {"still.ma", "--preferences", "store", "--json", "-"};
    words.insert(words.end(), further.begin(), further.end());
    return json::parse(import(words).out)["linearUnits"].get<int>();
  };
  EXPECT_EQ(handed({}), 1);
  EXPECT_EQ(handed({"--linear-units", "3"}), 3);
  EXPECT_EQ(handed({"--during", "entry", "--fail", "GetPrefLong:1=5"}), 0);
  EXPECT_EQ(handed({"--during", "entry", "--fail", "GetPrefLong:1=0"}), 0);
}

}  // namespace
}  // namespace mayascene_test
