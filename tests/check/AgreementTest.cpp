// The report against the import that it is about: over all scenes that lie here, over scenes of others where
// they lie beside the source folder, over scenes that are cut and patched, and over generated ones.
#include <gtest/gtest.h>

#include <algorithm>
#include <cstdint>
#include <filesystem>
#include <fstream>
#include <iostream>
#include <iterator>
#include <string>
#include <vector>

#include "tests/check/ChannelJudge.h"
#include "tests/check/GeneratedScene.h"
#include "tests/check/StopContradictions.h"
#include "tests/support/LeftOut.h"
#include "tests/support/LoadedHost.h"
#include "tests/support/SplitMix.h"
#include "tests/support/WideTests.h"
#include "tools/mayascene/ImportedLayers.h"

namespace check_test {
namespace {

namespace fs = std::filesystem;

// One host for many imports.
class Agreement {
 public:
  Agreement() = default;
  ~Agreement() {
    std::cout << compared_.scenes << " scenes, " << compared_.stops << " stops, " << compared_.layers
              << " layers, " << compared_.channels << " channels, " << compared_.keys << " keys, "
              << compared_.ambiguous << " layers of no certain node\n";
  }
  Agreement(const Agreement&) = delete;
  Agreement& operator=(const Agreement&) = delete;

  // What is contradicted; empty where nothing is.
  std::string Of(const std::string& text, bool wellFormed) {
    const refhost::CallbackResult result = host_.Import(text);
    const check::CameOver cameOver =
        mayascene::whatCameOver(mayascene::lookAtScene(host_.ScenePath()), result, false);
    const check::Report report = check::Check(text, cameOver, {.all = true, .only = {}});
    ++compared_.scenes;
    compared_.stops += cameOver.stop == check::Stop::None ? 0 : 1;
    const std::string wrong = StopContradictionIn(cameOver, report, wellFormed);
    if (!wrong.empty() || !wellFormed || cameOver.stop != check::Stop::None) return wrong;
    const PlainScene scene(text);
    return ChannelJudge(scene, cameOver, report, &compared_).Run();
  }

 private:
  testsupport::LoadedHost host_{testsupport::WithUnits(false)};
  Compared compared_;
};

std::string TextOf(const fs::path& path) {
  std::ifstream in(path, std::ios::binary);
  return {std::istreambuf_iterator<char>(in), {}};
}

std::vector<fs::path> ScenesIn(const fs::path& folder) {
  std::vector<fs::path> scenes;
  if (!fs::exists(folder)) return scenes;
  for (const auto& entry : fs::directory_iterator(folder)) {
    if (entry.path().extension() == ".ma") scenes.push_back(entry.path());
  }
  std::sort(scenes.begin(), scenes.end());
  return scenes;
}

std::vector<fs::path> OwnScenes() {
  std::vector<fs::path> scenes;
  for (const char* const folder :
       {"examples", "tests/scenes/hazards", "tests/scenes/production", "fuzz/seeds"}) {
    for (const fs::path& path : ScenesIn(fs::path(MAYASCENE_SOURCE_DIR) / folder)) scenes.push_back(path);
  }
  return scenes;
}

TEST(AgreementTest, OverAllScenesThatLieHere) {
  Agreement agreement;
  const std::vector<fs::path> scenes = OwnScenes();
  EXPECT_GT(scenes.size(), 50u);
  for (const fs::path& path : scenes) EXPECT_EQ(agreement.Of(TextOf(path), true), "") << path;
}

TEST(AgreementTest, OverScenesOfOthers) {
  Agreement agreement;
  const fs::path shared = fs::path(MAYASCENE_SOURCE_DIR) / ".." / "shared";
  std::size_t seen = 0;
  for (const char* const folder : {"scenes", "shots", "hazards"}) {
    for (const fs::path& path : ScenesIn(shared / folder)) {
      if (path.filename() == "q_chain_1000.ma") {
        std::cout << testsupport::kLeftOut << path.filename() << ", whose million layers take minutes\n";
        continue;
      }
      EXPECT_EQ(agreement.Of(TextOf(path), true), "") << path;
      ++seen;
    }
  }
  if (seen == 0) GTEST_SKIP() << testsupport::kLeftOut << "the scenes of ../shared, beside the source folder";
}

TEST(AgreementTest, OverScenesThatAreCutAnywhere) {
  Agreement agreement;
  for (const fs::path& path : ScenesIn(fs::path(MAYASCENE_SOURCE_DIR) / "fuzz/seeds")) {
    const std::string text = TextOf(path);
    const std::size_t step = testsupport::WideTestsWanted() && !MAYASCENE_SANITIZED ? 1 : 7;
    for (std::size_t end = 0; end < text.size(); end += step) {
      ASSERT_EQ(agreement.Of(text.substr(0, end), false), "") << path << " cut at " << end;
    }
  }
}

TEST(AgreementTest, OverScenesWithAByteChanged) {
  Agreement agreement;
  std::uint64_t random = 20261122;
  const auto below = [&random](std::size_t bound) { return testsupport::SplitMix(&random) % bound; };
  const std::vector<fs::path> seeds = ScenesIn(fs::path(MAYASCENE_SOURCE_DIR) / "fuzz/seeds");
  const std::string bytes("\0\n\r\"\\/*;|{}<=>#-.0e_ \xff", 22);
  const std::size_t changes = testsupport::HowMany({.quick = 800, .wide = 10'000, .sanitized = 1'000});
  for (std::size_t i = 0; i < changes; ++i) {
    std::string text = TextOf(seeds[i % seeds.size()]);
    const std::size_t at = below(text.size());
    text[at] = bytes[below(bytes.size())];
    ASSERT_EQ(agreement.Of(text, false), "") << "change " << i << " at " << at << ":\n" << text;
  }
}

TEST(AgreementTest, ChannelByChannelOverGeneratedScenes) {
  Agreement agreement;
  const std::size_t scenes = testsupport::HowMany({.quick = 400, .wide = 5'000, .sanitized = 500});
  for (std::uint64_t seed = 1; seed <= scenes; ++seed) {
    const std::string text = GeneratedScene(seed);
    ASSERT_EQ(agreement.Of(text, true), "") << "seed " << seed << ":\n" << text;
  }
}

}  // namespace
}  // namespace check_test
