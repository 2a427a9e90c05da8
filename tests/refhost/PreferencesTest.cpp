#include "refhost/Preferences.h"

#include <gtest/gtest.h>
#include <unistd.h>

#include <cstdlib>
#include <fstream>
#include <sstream>

#include "hostapi/PersistentDataSuite.h"
#include "tests/support/TemporaryFolder.h"

namespace refhost {
namespace {

using testsupport::TemporaryFolder;

namespace fs = std::filesystem;

TEST(Preferences, MissingFileCountsAsEmpty) {
  const TemporaryFolder folder;
  const Preferences preferences(folder.path() / "none");
  EXPECT_FALSE(preferences.fileExists());
  EXPECT_FALSE(preferences.find(HOST_PREF_SECTION, HOST_PREF_LINEAR_UNITS).has_value());
}

TEST(Preferences, EntriesBelongToTheirSection) {
  const TemporaryFolder folder;
  const fs::path file = folder.write("store", "[One]\nkey=1\nother=-7\n[Two]\nkey=2\n[One]\nlast=3\n");
  const Preferences preferences(file);
  EXPECT_TRUE(preferences.fileExists());
  EXPECT_EQ(preferences.find("One", "key"), 1);
  EXPECT_EQ(preferences.find("One", "other"), -7);
  EXPECT_EQ(preferences.find("One", "last"), 3);
  EXPECT_EQ(preferences.find("Two", "key"), 2);
  EXPECT_FALSE(preferences.find("Two", "other").has_value());
}

TEST(Preferences, LinesThatAreNoEntryAreDropped) {
  const TemporaryFolder folder;
  const fs::path file = folder.write(
      "store",
      "early=1\n\n[S]\r\ncrlf=2\r\nnothing\ntext=abc\nbig=2147483648\nsmall=-2147483648\nhalf=1x\nempty=\n");
  const Preferences preferences(file);
  EXPECT_EQ(preferences.find("S", "crlf"), 2);
  EXPECT_EQ(preferences.find("S", "small"), INT32_MIN);
  for (const char* dropped : {"early", "nothing", "text", "big", "half", "empty"}) {
    EXPECT_FALSE(preferences.find("S", dropped).has_value()) << dropped;
  }
}

TEST(Preferences, KeyMayHoldAnEqualsSign) {
  const TemporaryFolder folder;
  const Preferences preferences(folder.write("store", "[S]\na=b=4\n"));
  EXPECT_EQ(preferences.find("S", "a=b"), 4);
}

TEST(Preferences, WhatIsWrittenIsReadAgain) {
  const TemporaryFolder folder;
  const fs::path file = folder.path() / "deep" / "er" / "store";
  Preferences written(file);
  written.set(HOST_PREF_SECTION, HOST_PREF_LINEAR_UNITS, 1);
  written.set("Other [x]", "k", -2);
  std::string failure;
  ASSERT_TRUE(written.write(&failure)) << failure;
  EXPECT_EQ(folder.read("deep/er/store"), "[Maya Camera]\nUse Linear Units=1\n[Other [x]]\nk=-2\n");
  const Preferences read(file);
  EXPECT_EQ(read.find(HOST_PREF_SECTION, HOST_PREF_LINEAR_UNITS), 1);
  EXPECT_EQ(read.find("Other [x]", "k"), -2);
}

TEST(Preferences, WritingLeavesNothingBeside) {
  const TemporaryFolder folder;
  Preferences preferences(folder.path() / "store");
  preferences.set("S", "k", 1);
  std::string failure;
  ASSERT_TRUE(preferences.write(&failure));
  EXPECT_EQ(std::distance(fs::directory_iterator(folder.path()), fs::directory_iterator()), 1);
}

TEST(Preferences, WritingThroughALinkKeepsTheLink) {
  const TemporaryFolder folder;
  folder.write("real", "[S]\nk=1\n");
  fs::create_symlink("real", folder.path() / "link");
  Preferences preferences(folder.path() / "link");
  preferences.set("S", "k", 2);
  std::string failure;
  ASSERT_TRUE(preferences.write(&failure)) << failure;
  EXPECT_TRUE(fs::is_symlink(folder.path() / "link"));
  EXPECT_EQ(folder.read("real"), "[S]\nk=2\n");
}

TEST(Preferences, FileThatCannotBeWrittenIsReportedInWords) {
  const TemporaryFolder folder;
  folder.write("file", "");
  Preferences preferences(folder.path() / "file" / "store");
  std::string failure;
  EXPECT_FALSE(preferences.write(&failure));
  EXPECT_NE(failure.find("cannot be written"), std::string::npos) << failure;
}

TEST(Preferences, FolderInPlaceOfTheFileIsNotReadAndNotReplaced) {
  const TemporaryFolder folder;
  const Preferences preferences(folder.path());
  EXPECT_TRUE(preferences.fileExists());
  std::string failure;
  EXPECT_FALSE(preferences.write(&failure));
  EXPECT_TRUE(fs::is_directory(folder.path()));
}

TEST(Preferences, WithoutAPathTheStoreIsInMemoryOnly) {
  Preferences preferences{fs::path()};
  preferences.set("S", "k", 5);
  EXPECT_EQ(preferences.find("S", "k"), 5);
  EXPECT_FALSE(preferences.fileExists());
  std::string failure;
  EXPECT_FALSE(preferences.write(&failure));
  EXPECT_FALSE(failure.empty());
}

class UserFile : public ::testing::Test {
 protected:
  void SetUp() override {
    keep("XDG_CONFIG_HOME", &config_);
    keep("HOME", &home_);
  }
  void TearDown() override {
    restore("XDG_CONFIG_HOME", config_);
    restore("HOME", home_);
  }

 private:
  static void keep(const char* name, std::optional<std::string>* value) {
    if (const char* text = std::getenv(name)) *value = text;
  }
  static void restore(const char* name, const std::optional<std::string>& value) {
    if (value) {
      setenv(name, value->c_str(), 1);
    } else {
      unsetenv(name);
    }
  }

  std::optional<std::string> config_;
  std::optional<std::string> home_;
};

TEST_F(UserFile, LiesInTheConfigurationFolder) {
  setenv("XDG_CONFIG_HOME", "/config", 1);
  setenv("HOME", "/home/someone", 1);
  EXPECT_EQ(Preferences::userFile(), "/config/mayascene/preferences");
}

TEST_F(UserFile, LiesUnderHomeWithoutAConfigurationFolder) {
  unsetenv("XDG_CONFIG_HOME");
  setenv("HOME", "/home/someone", 1);
  EXPECT_EQ(Preferences::userFile(), "/home/someone/.config/mayascene/preferences");
}

TEST_F(UserFile, RelativeConfigurationFolderIsPassedOver) {
  setenv("XDG_CONFIG_HOME", "relative", 1);
  setenv("HOME", "/home/someone", 1);
  EXPECT_EQ(Preferences::userFile(), "/home/someone/.config/mayascene/preferences");
}

TEST_F(UserFile, IsEmptyWhenNeitherIsKnown) {
  unsetenv("XDG_CONFIG_HOME");
  unsetenv("HOME");
  EXPECT_TRUE(Preferences::userFile().empty());
}

}  // namespace
}  // namespace refhost
