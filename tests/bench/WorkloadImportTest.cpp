// What an import makes of the workloads is what the generator says it makes.
#include <gtest/gtest.h>

#include <ostream>
#include <sstream>
#include <string>

#include "bench/SceneGenerator.h"
#include "tests/support/LoadedHost.h"

namespace bench {

void PrintTo(const Workload& workload, std::ostream* out) { *out << workload.name; }

namespace {

class WorkloadImportTest : public testing::TestWithParam<Workload> {};

struct Imported {
  refhost::CallbackResult result;
  Built built;
};

Built BuiltIn(const refhost::Project& project) {
  Built built;
  for (const refhost::Layer& layer : project.layers()) {
    ++built.layers;
    for (const refhost::Stream& stream : layer.streams) {
      built.keys += static_cast<std::int64_t>(stream.keyCount());
    }
  }
  return built;
}

Imported Import(const std::string& text) {
  testsupport::LoadedHost host;
  Imported imported;
  imported.result = host.Import(text);
  imported.built = BuiltIn(host.project());
  return imported;
}

TEST_P(WorkloadImportTest, AnImportMakesAsManyLayersAndKeysAsTheGeneratorSays) {
  constexpr std::uint64_t kSeed = 20240229;
  for (const double scale : {0.002, 0.01}) {
    std::ostringstream out;
    const Built said = GetParam().write(out, scale, kSeed);
    const Imported imported = Import(out.str());
    EXPECT_EQ(imported.result.code, GetParam().code);
    if (GetParam().code != 0) continue;
    EXPECT_EQ(imported.built.layers, said.layers) << scale;
    EXPECT_EQ(imported.built.keys, said.keys) << scale;
    EXPECT_GT(said.layers, 2) << "more than a lone camera";
    EXPECT_GT(said.keys, 100);
  }
}

TEST_P(WorkloadImportTest, WhatIsStoppedMakesNothing) {
  if (GetParam().code == 0) return;
  std::ostringstream out;
  GetParam().write(out, 0.002, 1);
  EXPECT_EQ(Import(out.str()).built, Built());
}

INSTANTIATE_TEST_SUITE_P(workloads, WorkloadImportTest,
                         testing::ValuesIn(workloads().begin(), workloads().end()),
                         [](const auto& workload) { return std::string(workload.param.name); });

}  // namespace
}  // namespace bench
