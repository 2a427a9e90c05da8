// `mayascene prefs`, compared whole.
#include <gtest/gtest.h>

#include <filesystem>
#include <string>

#include "tests/tools/ToolRun.h"

namespace mayascene_test {
namespace {

using PrefsCommand = ToolTest;

TEST_F(PrefsCommand, ShowingSaysWhatHoldsAndMakesNoStore) {
  const ToolResult result = run({"prefs", "--preferences", "store"});
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.out,
            "linear-units  0  (distances are taken as they stand)\n"
            "store         store  (not made yet)\n");
  EXPECT_EQ(result.err, "");
  EXPECT_TRUE(files().empty());
}

TEST_F(PrefsCommand, SettingWritesTheStoreAndShowsIt) {
  const ToolResult result = run({"prefs", "set", "linear-units", "1", "--preferences", "store"});
  EXPECT_EQ(result.status, 0);
  EXPECT_EQ(result.out,
            "linear-units  1  (distances are converted from the scene's linear unit to points)\n"
            "store         store\n");
  EXPECT_EQ(read("store"), "[Maya Camera]\nUse Linear Units=1\n");
  EXPECT_EQ(run({"prefs", "--preferences", "store"}).out, result.out);
  EXPECT_EQ(run({"prefs", "--preferences", "store", "set", "linear-units", "0"}).status, 0);
  EXPECT_EQ(read("store"), "[Maya Camera]\nUse Linear Units=0\n");
  EXPECT_EQ(files(), std::vector<std::string>{"store"});
}

TEST_F(PrefsCommand, WithoutTheOptionItIsTheUsersOwnStore) {
  environment["XDG_CONFIG_HOME"] = path("config").string();
  EXPECT_EQ(run({"prefs", "set", "linear-units", "1"}).status, 0);
  EXPECT_EQ(read("config/mayascene/preferences"), "[Maya Camera]\nUse Linear Units=1\n");
}

TEST_F(PrefsCommand, AStoreThatCannotBeWrittenIsFive) {
  write("file", "");
  const ToolResult result = run({"prefs", "set", "linear-units", "1", "--preferences", "file/store"});
  EXPECT_EQ(result.status, 5);
  EXPECT_EQ(result.out, "");
  EXPECT_EQ(result.err, "mayascene: the preferences cannot be written to file/store\n");
}

TEST_F(PrefsCommand, WithoutAPlaceForAStoreItSaysSo) {
  environment["XDG_CONFIG_HOME"] = "";
  environment["HOME"] = "";
  const ToolResult result = run({"prefs"});
  EXPECT_EQ(result.status, 5);
  EXPECT_EQ(result.err.find("mayascene: there is no place for the preference store"), 0u) << result.err;
}

}  // namespace
}  // namespace mayascene_test
