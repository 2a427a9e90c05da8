// Each exit status, and which one wins.
#include <gtest/gtest.h>
#include <sys/stat.h>

#include <cstdlib>
#include <filesystem>
#include <string>
#include <vector>

#include "tests/tools/ToolRun.h"

namespace mayascene_test {
namespace {

class ExitStatusTest : public ToolTest {
 protected:
  ExitStatusTest() {
    write("good.ma", sceneText(stillCamera()));
    write("notes.txt", "just some notes\n");
    write("broken.ma", sceneText("createNode transform -n \"open;\n"));
  }
};

TEST_F(ExitStatusTest, AllImportedIsZero) { EXPECT_EQ(run({"import", "good.ma", "good.ma"}).status, 0); }

TEST_F(ExitStatusTest, ARefusedSceneIsOneAndTheOthersAreImported) {
  const ToolResult result = run({"import", "notes.txt", "good.ma"});
  EXPECT_EQ(result.status, 1);
  EXPECT_NE(result.out.find("good.ma: 1 composition, 1 camera"), std::string::npos) << result.out;
}

TEST_F(ExitStatusTest, AReturnedCodeIsOneAndTheOthersAreImported) {
  const ToolResult result = run({"import", "broken.ma", "good.ma"});
  EXPECT_EQ(result.status, 1);
  EXPECT_NE(result.err.find("broken.ma: error 1289986 (MAYA_UNEXPECTED_END): "), std::string::npos)
      << result.err;
  EXPECT_NE(result.out.find("good.ma: 1 composition, 1 camera"), std::string::npos) << result.out;
}

TEST_F(ExitStatusTest, ASceneThatIsTooShortToReadIsOne) {
  write("short.ma", "//Maya\n");
  const ToolResult result = run({"import", "short.ma"});
  EXPECT_EQ(result.status, 1);
  EXPECT_NE(result.err.find("short.ma: error 2022 (FILE_SHORT_READ): "), std::string::npos) << result.err;
}

TEST_F(ExitStatusTest, AReadThatFailsWithoutACodeIsOne) {
  EXPECT_EQ(run({"import", "good.ma", "--fail", "FileRead:1=0"}).status, 1);
}

TEST_F(ExitStatusTest, ASceneOfTwoGigabytesIsOne) {
  write("huge.ma", sceneText(stillCamera()));
  std::filesystem::resize_file(path("huge.ma"), std::uintmax_t{1} << 31);  // sparse
  const ToolResult result = run({"import", "huge.ma"});
  EXPECT_EQ(result.status, 1);
  EXPECT_NE(result.err.find("huge.ma: error 2023 (FILE_SIZE): "), std::string::npos) << result.err;
}

TEST_F(ExitStatusTest, WrongUsageIsTwoAndPrintsNoData) {
  const ToolResult result = run({"import"});
  EXPECT_EQ(result.status, 2);
  EXPECT_EQ(result.out, "");
  EXPECT_EQ(result.err, "mayascene: SCENE is required\nRun mayascene import --help for how it is used.\n");
}

TEST_F(ExitStatusTest, AFileThatIsMissingIsThreeAndTheOthersAreImported) {
  const ToolResult result = run({"import", "missing.ma", "good.ma"});
  EXPECT_EQ(result.status, 3);
  EXPECT_NE(result.err.find("mayascene: missing.ma: cannot be opened: No such file or directory\n"),
            std::string::npos)
      << result.err;
  EXPECT_EQ(result.out.find("good.ma: 1 composition, 1 camera"), 0u) << result.out;
}

TEST_F(ExitStatusTest, AFolderAndAFifoAreThreeAndNotWaitedFor) {
  ASSERT_EQ(::mkfifo(path("fifo").c_str(), 0600), 0);
  EXPECT_EQ(run({"import", "fifo"}).status, 3);
  EXPECT_EQ(run({"import", "."}).err, "mayascene: .: is a directory, not a file\n");
  EXPECT_EQ(run({"verify", "fifo"}).status, 3);
}

TEST_F(ExitStatusTest, TheHighestOfTheScenesWins) {
  EXPECT_EQ(run({"import", "missing.ma", "notes.txt", "good.ma"}).status, 3);
  EXPECT_EQ(run({"import", "notes.txt", "missing.ma"}).status, 3);
}

TEST_F(ExitStatusTest, AModuleThatCannotBeLoadedIsFour) {
  const ToolResult missing = run({"import", "good.ma", "--module", "missing.so"});
  EXPECT_EQ(missing.status, 4);
  EXPECT_EQ(missing.out, "");
  EXPECT_EQ(missing.err.find("mayascene: the module cannot be loaded: "), 0u) << missing.err;
  EXPECT_EQ(run({"verify", "good.ma", "--module", "good.ma"}).status, 4);
}

TEST_F(ExitStatusTest, AModuleThatIsAFifoIsFourAndNotWaitedFor) {
  ASSERT_EQ(::mkfifo(path("fifo").c_str(), 0600), 0);
  const ToolResult result = run({"import", "good.ma", "--module", "fifo"});
  EXPECT_EQ(result.status, 4);
  EXPECT_EQ(result.err, "mayascene: the module cannot be loaded: " + path("fifo").string() +
                            ": it is not a regular file\n");
}

TEST_F(ExitStatusTest, ALibraryWithoutTheEntryIsFour) {
  const std::string library = std::filesystem::path(MAYASCENE_MODULE).parent_path() / "libhostutil.so";
  const ToolResult result = run({"import", "good.ma", "--module", library});
  EXPECT_EQ(result.status, 4);
  EXPECT_EQ(result.err.find("mayascene: the module has no entry: "), 0u) << result.err;
}

TEST_F(ExitStatusTest, AnEntryThatReturnsACodeIsFour) {
  const ToolResult result =
      run({"import", "good.ma", "--during", "entry", "--fail", "RegisterImporterName:1=77"});
  EXPECT_EQ(result.status, 4);
  EXPECT_EQ(result.out, "");
  EXPECT_EQ(result.err, "mayascene: the module's entry: error 77: an unknown code\n");
}

TEST_F(ExitStatusTest, TranslationsThatCannotBeReadAreThree) {
  EXPECT_EQ(run({"import", "good.ma", "--translations", "missing.txt"}).status, 3);
}

TEST_F(ExitStatusTest, AnOutputThatCannotBeWrittenIsFiveBeforeAnythingIsImported) {
  const ToolResult result = run({"import", "good.ma", "--json", "no/folder/x.json"});
  EXPECT_EQ(result.status, 5);
  EXPECT_EQ(result.out, "");
  EXPECT_EQ(result.err, "mayascene: no/folder/x.json cannot be written: No such file or directory\n");
}

TEST_F(ExitStatusTest, AnOutputThatIsFullIsFive) {
  const ToolResult result = run({"import", "good.ma", "--quiet", "--json", "/dev/full"});
  EXPECT_EQ(result.status, 5);
  EXPECT_EQ(result.err, "mayascene: /dev/full cannot be written: No space left on device\n");
}

// Every verb ends by the one table. What a verb cannot meet is left out: only an import and a verification
// load a module, and the preference reads no scene.
struct Ending {
  int status;
  std::vector<std::string> arguments;
};

TEST_F(ExitStatusTest, EveryVerbEndsByTheOneTable) {
  write("film.ma", sceneText("createNode transform -n \"a\";\ncreateNode camera -n \"aShape\" -p \"a\";\n"
                             "\tsetAttr \".fio\" -type \"double2\" 0.1 0 ;\n"));
  write("far.ma", sceneText(std::string(stillCamera()) +
                            "createNode animCurveTL -n \"c\";\n\tsetAttr \".ktv[0:1]\" 1 0 1000000000 1;\n"
                            "connectAttr \"c.o\" \"shotcam.tx\";\n"));
  const std::vector<Ending> endings = {
      {0, {"import", "good.ma"}},
      {0, {"import", "--bake", "film.ma"}},
      {0, {"verify", "good.ma"}},
      {0, {"bake", "good.ma", "-o", "out.ma"}},
      {0, {"bake", "film.ma", "-o", "out.ma"}},  // with a warning
      {0, {"prefs", "--preferences", "p"}},
      {0, {"prefs", "set", "linear-units", "0", "--preferences", "p"}},
      {1, {"import", "notes.txt"}},
      {1, {"import", "broken.ma"}},
      {1, {"import", "--bake", "notes.txt"}},
      {1, {"import", "--bake", "far.ma"}},
      {1, {"import", "--bake", "--camera", "nobody", "good.ma"}},
      {1, {"import", "--bake", "--strict", "film.ma"}},
      {1, {"import", "--bake", "good.ma", "--fail", "CreateComp:1=77"}},
      {1, {"verify", "notes.txt"}},
      {1, {"bake", "notes.txt", "-o", "out.ma"}},
      {1, {"bake", "far.ma", "-o", "out.ma"}},
      {1, {"bake", "--camera", "nobody", "good.ma", "-o", "out.ma"}},
      {1, {"bake", "--strict", "film.ma", "-o", "out.ma"}},
      {2, {}},
      {2, {"import"}},
      {2, {"import", "--world", "good.ma"}},
      {2, {"verify", "--world", "good.ma"}},
      {2, {"bake", "good.ma"}},
      {2, {"bake", "good.ma", "-o", "good.ma"}},
      {2, {"bake", "good.ma", "film.ma", "-o", "notes.txt"}},
      {2, {"prefs", "set", "linear-units", "2"}},
      {3, {"import", "missing.ma"}},
      {3, {"import", "--bake", "missing.ma"}},
      {3, {"import", "--bake", "."}},
      {3, {"import", "--bake", ".."}},
      {3, {"verify", "missing.ma"}},
      {3, {"bake", "missing.ma", "-o", "out.ma"}},
      {4, {"import", "good.ma", "--module", "missing.so"}},
      {4, {"import", "--bake", "good.ma", "--module", "missing.so"}},
      {4, {"verify", "good.ma", "--module", "missing.so"}},
      {5, {"import", "good.ma", "--json", "no/x.json"}},
      {5, {"import", "--bake", "good.ma", "--report", "no/x.json"}},
      {5, {"verify", "good.ma", "--trace", "no/x"}},
      {5, {"bake", "good.ma", "-o", "no/out.ma"}},
      {5, {"bake", "good.ma", "film.ma", "-o", "notes.txt/folder"}},
      {5, {"prefs", "set", "linear-units", "0", "--preferences", "notes.txt/p"}},
  };
  for (const Ending& ending : endings) {
    const ToolResult result = run(ending.arguments);
    EXPECT_EQ(result.status, ending.status) << testing::PrintToString(ending.arguments) << '\n' << result.err;
  }
}

TEST_F(ExitStatusTest, TheHighestOfSeveralBakesWins) {
  EXPECT_EQ(run({"bake", "-q", "good.ma", "notes.txt", "-o", "out"}).status, 1);
  EXPECT_EQ(run({"bake", "-q", "missing.ma", "notes.txt", "good.ma", "-o", "out"}).status, 3);
  EXPECT_EQ(run({"import", "--bake", "-q", "missing.ma", "notes.txt", "good.ma"}).status, 3);
}

TEST_F(ExitStatusTest, TheHelpOfEveryVerbShowsTheTable) {
  for (const char* const verb : {"", "import", "bake", "export", "check", "verify", "prefs"}) {
    std::vector<std::string> words = {verb, "--help"};
    if (words.front().empty()) words.erase(words.begin());
    const std::string help = run(words).out;
    EXPECT_NE(
        help.find(
            "Exit status:\n"
            "  0  done, warnings included\n"
            "  1  an error in a scene, a file that is not taken, something asked for that was not done, "
            "memory or\n"
            "     handles that the importer kept, or warnings with --strict\n"
            "  2  wrong usage\n"
            "  3  a file cannot be read\n"
            "  4  the import module cannot be loaded\n"
            "  5  an output cannot be written, or the memory is exhausted\n"
            "With several scenes it is the highest of theirs. A run that a signal ends has 128 and the "
            "number of\nthe signal.\n"),
        std::string::npos)
        << help;
  }
}

// Sanitizers need more address space than there is memory.
#if !MAYASCENE_SANITIZED
TEST_F(ExitStatusTest, MemoryThatIsExhaustedIsFive) {
  write("many.ma", sceneText(std::string(stillCamera()) + std::string(64 << 20, ' ')));
  const std::string tool =
      std::string("cd '") + path("").string() + "' && ulimit -v 60000 && exec '" + MAYASCENE_TOOL;
  EXPECT_EQ(std::system(("sh -c \"" + tool + "' bake many.ma -o out.ma\" 2>/dev/null").c_str()) >> 8, 5);
  EXPECT_FALSE(std::filesystem::exists(path("out.ma")));
}
#endif

}  // namespace
}  // namespace mayascene_test
