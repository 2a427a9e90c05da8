#include "tools/mayascene/OutputFile.h"

#include <sys/stat.h>
#include <unistd.h>

#include <filesystem>
#include <string>

#include "tests/tools/ToolRun.h"

namespace mayascene {
namespace {

using Names = std::vector<std::string>;

class OutputFileTest : public mayascene_test::ToolTest {
 protected:
  std::string target = path("out.json").string();
  std::string failure;
};

TEST_F(OutputFileTest, TheFileAppearsWithTheCommitAndNothingElseStays) {
  const auto output = OutputFile::open(target, &failure);
  ASSERT_NE(output, nullptr) << failure;
  output->stream() << std::string(200'000, 'x') << std::flush;
  EXPECT_FALSE(std::filesystem::exists(target));
  ASSERT_TRUE(output->commit(&failure)) << failure;
  EXPECT_EQ(read("out.json"), std::string(200'000, 'x'));
  EXPECT_EQ(files(), Names{"out.json"});
}

TEST_F(OutputFileTest, WithoutACommitWhatLayThereStays) {
  write("out.json", "before");
  {
    const auto output = OutputFile::open(target, &failure);
    ASSERT_NE(output, nullptr) << failure;
    output->stream() << "half" << std::flush;
    EXPECT_EQ(read("out.json"), "before");
  }
  EXPECT_EQ(read("out.json"), "before");
  EXPECT_EQ(files(), Names{"out.json"});
}

TEST_F(OutputFileTest, AFileThatIsReplacedKeepsItsPermissions) {
  write("out.json", "before");
  ASSERT_EQ(::chmod(target.c_str(), 0640), 0);
  const auto output = OutputFile::open(target, &failure);
  ASSERT_NE(output, nullptr) << failure;
  output->stream() << "after";
  ASSERT_TRUE(output->commit(&failure)) << failure;
  struct stat status {};
  ASSERT_EQ(::stat(target.c_str(), &status), 0);
  EXPECT_EQ(status.st_mode & 07777u, 0640u);
  EXPECT_EQ(read("out.json"), "after");
}

TEST_F(OutputFileTest, ASymbolicLinkStaysALink) {
  write("real.json", "before");
  std::filesystem::create_symlink("real.json", target);
  const auto output = OutputFile::open(target, &failure);
  ASSERT_NE(output, nullptr) << failure;
  output->stream() << "after";
  ASSERT_TRUE(output->commit(&failure)) << failure;
  EXPECT_TRUE(std::filesystem::is_symlink(target));
  EXPECT_EQ(read("real.json"), "after");
}

TEST_F(OutputFileTest, ASymbolicLinkToAFileThatIsNotThereYetStaysALink) {
  std::filesystem::create_directory(path("far"));
  std::filesystem::create_symlink("far/second.json", target);
  std::filesystem::create_symlink("real.json", path("far/second.json"));
  const auto output = OutputFile::open(target, &failure);
  ASSERT_NE(output, nullptr) << failure;
  output->stream() << "made";
  ASSERT_TRUE(output->commit(&failure)) << failure;
  EXPECT_TRUE(std::filesystem::is_symlink(target));
  EXPECT_TRUE(std::filesystem::is_symlink(path("far/second.json")));
  EXPECT_EQ(read("far/real.json"), "made");
}

TEST_F(OutputFileTest, ASymbolicLinkThatLeadsInACircleStaysALinkAndIsReported) {
  std::filesystem::create_symlink("out.json", target);
  EXPECT_EQ(OutputFile::open(target, &failure), nullptr);
  EXPECT_EQ(failure, target + " cannot be written: Too many levels of symbolic links");
  EXPECT_TRUE(std::filesystem::is_symlink(target));
}

TEST_F(OutputFileTest, ALogStandsUnderItsNameFromTheStartAndStaysWithoutACommit) {
  write("calls.jsonl", "of an earlier and longer run");
  {
    const auto log = OutputFile::openLog(path("calls.jsonl").string(), &failure);
    ASSERT_NE(log, nullptr) << failure;
    log->stream() << "first line\n" << std::flush;
    EXPECT_EQ(read("calls.jsonl"), "first line\n");
  }
  EXPECT_EQ(read("calls.jsonl"), "first line\n");
  EXPECT_EQ(files(), Names{"calls.jsonl"});
}

TEST_F(OutputFileTest, ALogThatCannotBeWrittenIsReportedAtOnceOrWithTheCommit) {
  EXPECT_EQ(OutputFile::openLog(path("no/such/log").string(), &failure), nullptr);
  EXPECT_EQ(failure, path("no/such/log").string() + " cannot be written: No such file or directory");
  const auto log = OutputFile::openLog("/dev/full", &failure);
  ASSERT_NE(log, nullptr) << failure;
  log->stream() << "too much";
  EXPECT_FALSE(log->commit(&failure));
  EXPECT_EQ(failure, "/dev/full cannot be written: No space left on device");
}

TEST_F(OutputFileTest, ADeviceIsWrittenAndNotReplaced) {
  const auto output = OutputFile::open("/dev/null", &failure);
  ASSERT_NE(output, nullptr) << failure;
  output->stream() << "gone";
  EXPECT_TRUE(output->commit(&failure)) << failure;
  EXPECT_TRUE(std::filesystem::is_character_file("/dev/null"));
}

TEST_F(OutputFileTest, AFullDeviceIsReportedWithTheCommit) {
  const auto output = OutputFile::open("/dev/full", &failure);
  ASSERT_NE(output, nullptr) << failure;
  output->stream() << "too much";
  EXPECT_FALSE(output->commit(&failure));
  EXPECT_EQ(failure, "/dev/full cannot be written: No space left on device");
}

TEST_F(OutputFileTest, WhatCannotBeWrittenIsReportedAtOnce) {
  EXPECT_EQ(OutputFile::open(path("no/such/folder.json").string(), &failure), nullptr);
  EXPECT_EQ(failure, path("no/such/folder.json").string() + " cannot be written: No such file or directory");
  EXPECT_EQ(OutputFile::open(path("").string(), &failure), nullptr);
  EXPECT_NE(failure.find("Is a directory"), std::string::npos) << failure;
}

}  // namespace
}  // namespace mayascene
