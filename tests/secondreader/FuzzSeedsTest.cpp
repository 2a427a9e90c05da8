// The scenes that fuzzing begins with: small, imported whole, and together they reach all that makes layers
// and keys.
#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <set>
#include <sstream>
#include <string>
#include <vector>

#include "tests/secondreader/SceneRun.h"

namespace secondreader {
namespace {

constexpr std::size_t kLongest = 1000;

std::vector<std::filesystem::path> seeds() {
  std::vector<std::filesystem::path> paths;
  for (const auto& entry : std::filesystem::directory_iterator(MAYASCENE_SOURCE_DIR "/fuzz/seeds")) {
    paths.push_back(entry.path());
  }
  std::sort(paths.begin(), paths.end());
  return paths;
}

std::string callOf(const std::string& line) {
  const std::string lead = "{\"call\":\"";
  return line.substr(lead.size(), line.find('"', lead.size()) - lead.size());
}

TEST(FuzzSeedsTest, EachIsShortAndImportedWholeAndTogetherTheyReachEveryCallThatMakesALayer) {
  SceneRunner runner;
  std::set<std::string> calls;
  int aimedCameras = 0;
  for (const std::filesystem::path& path : seeds()) {
    std::ostringstream read;
    read << std::ifstream(path, std::ios::binary).rdbuf();
    EXPECT_LT(read.str().size(), kLongest) << path;
    const RunReport report = runner.run({}, path.filename(), read.str());
    EXPECT_EQ(report.disagreement, std::nullopt) << path;
    EXPECT_EQ(report.prediction.imports.front().code, 0) << path;
    for (const PredictedLine& predicted : report.prediction.trace) {
      const std::string& line = predicted.text;
      calls.insert(callOf(line));
      if (line.find(R"("flag":8192,"value":1)") != std::string::npos) ++aimedCameras;
    }
  }
  for (const char* call :
       {"CreateComp", "GetItemFromComp", "AddLayerFromItem", "NewCameraLayer", "NewNullLayer", "SetLayerFlag",
        "SetLayerParent", "SetCameraFilmSize", "AcquireLayerStream", "ReleaseStream", "SetStreamValue",
        "GetStreamKeyframeCount", "BeginKeyframeBatch", "AddBatchKeyframe", "SetBatchKeyframeValue",
        "EndKeyframeBatch"}) {
    EXPECT_EQ(calls.count(call), 1u) << call;
  }
  EXPECT_GT(aimedCameras, 0);
}

}  // namespace
}  // namespace secondreader
