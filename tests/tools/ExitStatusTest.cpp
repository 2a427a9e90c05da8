// Each exit status, and which one wins.
#include <gtest/gtest.h>
#include <sys/stat.h>

#include <filesystem>
#include <string>

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
  EXPECT_EQ(result.err, "mayascene: SCENE is required\nRun mayascene --help for how it is used.\n");
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
  EXPECT_EQ(result.err,
            "mayascene: the module cannot be loaded: " + path("fifo").string() + ": it is no regular file\n");
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
  EXPECT_EQ(result.err, "mayascene: the module's entry: error 77: a code of no known meaning\n");
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

}  // namespace
}  // namespace mayascene_test
