// second-reader-campaign FIRST_SEED COUNT [--failures] [--write FOLDER]: any number of generated scenes.
#include <chrono>
#include <cstdint>
#include <cstdio>
#include <exception>
#include <fstream>
#include <string>

#include "tests/secondreader/SceneGenerator.h"
#include "tests/secondreader/SceneRun.h"

namespace {

constexpr int kShown = 5;
constexpr int kUsageStatus = 2;

struct Campaign {
  std::uint64_t first = 0;
  std::uint64_t count = 0;
  bool failures = false;
  std::string folder;  // where scenes that disagree are written; empty: nowhere
};

bool readArguments(int count, char** arguments, Campaign* campaign) {
  if (count < 3) return false;
  campaign->first = std::stoull(arguments[1]);
  campaign->count = std::stoull(arguments[2]);
  for (int i = 3; i < count; ++i) {
    const std::string argument = arguments[i];
    if (argument == "--failures") {
      campaign->failures = true;
    } else if (argument == "--write" && i + 1 < count) {
      campaign->folder = arguments[++i];
    } else {
      return false;
    }
  }
  return true;
}

int run(const Campaign& campaign) {
  secondreader::SceneRunner runner;
  secondreader::SeedReport total;
  std::uint64_t disagreements = 0;
  const auto start = std::chrono::steady_clock::now();
  for (std::uint64_t seed = campaign.first; seed < campaign.first + campaign.count; ++seed) {
    const secondreader::SeedReport report = runSeed(runner, seed, campaign.failures);
    total.runs += report.runs;
    total.ended += report.ended;
    total.imported += report.imported;
    total.lines += report.lines;
    if (!report.disagreement) continue;
    if (++disagreements <= kShown) std::printf("%s\n", report.disagreement->c_str());
    if (!campaign.folder.empty()) {
      std::ofstream(campaign.folder + "/scene-" + std::to_string(seed) + ".ma", std::ios::binary)
          << secondreader::SceneGenerator(seed).make().bytes;
    }
  }
  const std::chrono::duration<double> taken = std::chrono::steady_clock::now() - start;
  std::printf(
      "%llu scenes, %d runs (%d imported with code 0, %d ended their process as predicted), "
      "%llu lines, %llu disagreements, %.1f seconds\n",
      static_cast<unsigned long long>(campaign.count), total.runs, total.imported, total.ended,
      static_cast<unsigned long long>(total.lines), static_cast<unsigned long long>(disagreements),
      taken.count());
  return disagreements == 0 ? 0 : 1;
}

}  // namespace

int main(int count, char** arguments) {
  Campaign campaign;
  try {
    if (readArguments(count, arguments, &campaign)) return run(campaign);
  } catch (const std::exception& exception) {
    std::fprintf(stderr, "%s\n", exception.what());
  }
  std::fprintf(stderr, "usage: second-reader-campaign FIRST_SEED COUNT [--failures] [--write FOLDER]\n");
  return kUsageStatus;
}
