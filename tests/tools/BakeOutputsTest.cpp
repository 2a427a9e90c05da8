// Where the outputs of many scenes go.
#include "tools/mayascene/BakeOutputs.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <set>
#include <string>
#include <vector>

#include "tests/support/TemporaryFolder.h"

namespace {

using mayascene::ExitStatus;

TEST(BakeOutputs, ScenesOfOneNameGetANumberEachWithoutRegardToCase) {
  const testsupport::TemporaryFolder folder;
  std::vector<std::string> scenes = {"a/shot.ma", "b/SHOT.ma", "c/shot_2.ma", "d/shot.ma"};
  std::vector<std::string> places;
  std::string failure;
  ASSERT_EQ(mayascene::placeOutputs(scenes, folder.path().string(), ".ma", "", &places, &failure),
            ExitStatus::Done);
  ASSERT_EQ(places.size(), 4u);
  const char* const wanted[] = {"shot.ma", "SHOT_2.ma", "shot_2_2.ma", "shot_3.ma"};
  for (std::size_t i = 0; i < places.size(); ++i) {
    EXPECT_EQ(std::filesystem::path(places[i]).filename(), wanted[i]);
  }
}

TEST(BakeOutputs, ThousandsOfScenesOfOneNameGetANameEach) {
  const testsupport::TemporaryFolder folder;
  std::vector<std::string> scenes;
  for (int i = 0; i < 2'000; ++i) scenes.push_back("folder" + std::to_string(i) + "/shot.ma");
  std::vector<std::string> places;
  std::string failure;
  ASSERT_EQ(mayascene::placeOutputs(scenes, folder.path().string(), ".ma", "", &places, &failure),
            ExitStatus::Done);
  EXPECT_EQ(std::set<std::string>(places.begin(), places.end()).size(), scenes.size());
}

TEST(BakeOutputs, NoSceneAndNoReportIsWrittenOver) {
  const testsupport::TemporaryFolder folder;
  const std::string scene = (folder.path() / "shot.ma").string();
  std::ofstream(scene) << "text";
  std::vector<std::string> places;
  std::string failure;
  EXPECT_EQ(
      mayascene::placeOutputs({"else/shot.ma", scene}, folder.path().string(), ".ma", "", &places, &failure),
      ExitStatus::WrongUsage);
  EXPECT_EQ(failure, scene + " is one of the scenes and would be overwritten");
  places.clear();
  const std::string report = (folder.path() / "late.ma").string();
  EXPECT_EQ(mayascene::placeOutputs({"else/late.ma", scene}, folder.path().string(), ".ma", report, &places,
                                    &failure),
            ExitStatus::WrongUsage);
}

}  // namespace
