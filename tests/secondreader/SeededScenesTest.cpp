// Generated scenes: the second reader predicts what the importer does with each, also when the host fails.
#include <gtest/gtest.h>

#include <map>
#include <set>
#include <string>

#include "hostapi/ErrorCodes.h"
#include "refhost/Operations.h"
#include "tests/secondreader/SceneGenerator.h"
#include "tests/secondreader/SceneRun.h"
#include "tests/support/WideTests.h"

namespace secondreader {
namespace {

constexpr std::uint64_t kShares = 4;     // of which several can run at once
constexpr std::uint64_t kScenes = 2000;  // the wide test's

std::uint64_t scenesPerShare() {
  return testsupport::HowMany({.quick = 125, .wide = kScenes / kShares, .sanitized = 125});
}

class SeededScenesTest : public ::testing::TestWithParam<std::uint64_t> {};

TEST_P(SeededScenesTest, EachSceneGivesThePredictedTracesWithoutAndWithFailures) {
  const std::uint64_t scenes = scenesPerShare();
  SceneRunner runner;
  int runs = 0;
  int ended = 0;
  int imported = 0;
  for (std::uint64_t seed = GetParam() * scenes; seed < (GetParam() + 1) * scenes; ++seed) {
    const SeedReport report = runSeed(runner, seed, true);
    runs += report.runs;
    ended += report.ended;
    imported += report.imported;
    ASSERT_EQ(report.disagreement, std::nullopt);
  }
  EXPECT_EQ(runs, static_cast<int>(2 * scenes));
  // Some end the process, but few, and a good share is imported whole.
  EXPECT_GT(ended, runs / 100);
  EXPECT_LT(ended, runs / 10);
  EXPECT_GT(imported, static_cast<int>(2 * scenes / 3));
}

INSTANTIATE_TEST_SUITE_P(Shares, SeededScenesTest, ::testing::Range(std::uint64_t{0}, kShares));

TEST(SceneGeneratorTest, ASeedAlwaysGivesTheSameScene) {
  EXPECT_EQ(SceneGenerator(17).make().bytes, SceneGenerator(17).make().bytes);
  EXPECT_NE(SceneGenerator(17).make().bytes, SceneGenerator(18).make().bytes);
}

// A look at the generator, not at the importer; few scenes would not do.
#if !MAYASCENE_SANITIZED
TEST(SceneGeneratorTest, TheScenesReachEveryCallOfAnImportAndEveryKindOfFailure) {
  std::set<std::string> calls;
  std::map<HostError, int> codes;
  for (std::uint64_t seed = 0; seed < kScenes; ++seed) {
    const GeneratedScene scene = SceneGenerator(seed).make();
    const Prediction prediction = predict(scene.options, "/" + scene.fileName, scene.bytes, scene.imports);
    ++codes[prediction.imports.front().code];
    for (const PredictedLine& line : prediction.trace) {
      const std::string lead = "{\"call\":\"";
      calls.insert(line.text.substr(lead.size(), line.text.find('"', lead.size()) - lead.size()));
    }
  }
  for (std::size_t operation = 0; operation < refhost::kOperationCount; ++operation) {
    EXPECT_EQ(calls.count(refhost::factsOf(static_cast<refhost::Operation>(operation)).name), 1u);
  }
  for (const HostError code :
       {HOST_ERR_NONE, HOST_ERR_MAYA_SYNTAX, HOST_ERR_MAYA_UNEXPECTED_END, HOST_ERR_MAYA_KEY_COUNTS,
        HOST_ERR_NUMBER_SYNTAX, HOST_ERR_NUMBER_RANGE, HOST_ERR_MATRIX_NOT_FINITE, HOST_ERR_BAD_SIZE,
        HOST_ERR_BAD_RATIO, HOST_ERR_BAD_VALUE, HOST_ERR_BAD_FILM_SIZE}) {
    EXPECT_GT(codes[code], 0) << code;
  }
}
#endif

}  // namespace
}  // namespace secondreader
