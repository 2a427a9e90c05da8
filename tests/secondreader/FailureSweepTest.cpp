// Every suite call and every call of a utility service is made to fail, one after the other and in every way,
// in the imports of small scenes and of the examples, in the entry and in the header test. The second reader
// predicts each result.
#include <gtest/gtest.h>

#include <algorithm>
#include <cstdio>
#include <filesystem>
#include <fstream>
#include <map>
#include <set>
#include <sstream>
#include <string>
#include <utility>
#include <vector>

#include "hostapi/ErrorCodes.h"
#include "refhost/Operations.h"
#include "tests/secondreader/FailureScenes.h"
#include "tests/secondreader/SceneRun.h"
#include "tests/support/WideTests.h"

namespace secondreader {
namespace {

using refhost::Callback;
using refhost::Failure;

constexpr HostError kRehearsed = -77;  // no code of the host's or the importer's own
constexpr std::int32_t kStoredUnits = 5;
constexpr Failure::Kind kExceptions[] = {Failure::Kind::BadAlloc, Failure::Kind::RuntimeError,
                                         Failure::Kind::Other};

// So many calls are walked at most, every so many, and beside them the first of each operation; of a service
// as well. All are where all tests are wanted.
constexpr testsupport::Share kCalls = {.quick = 70, .wide = 700, .sanitized = 70};
constexpr testsupport::Share kCallsOfLongScenes = {.quick = 12, .wide = 700, .sanitized = 12};
constexpr testsupport::Share kServiceCalls = {.quick = 4, .wide = 60, .sanitized = 4};
constexpr std::size_t kLongScene = 250;  // calls

struct SweptScene {
  std::string name;
  std::string text;
  int zoomKeys = 0;
  Callback during = Callback::Import;
};

void PrintTo(const SweptScene& scene, std::ostream* out) { *out << scene.name; }

std::vector<SweptScene> sweptScenes() {
  std::vector<SweptScene> scenes = {
      {"Entry", "//Maya ASCII\n", 0, Callback::Entry},
      {"VerifyAScene", "//Maya ASCII 2020 scene\n", 0, Callback::Verify},
      {"VerifyALetter", "This is a letter and not a scene.\n", 0, Callback::Verify},
      {"VerifyAShortFile", "//Maya", 0, Callback::Verify},
  };
  for (const testsupport::FailureScene& scene : testsupport::FailureScenes()) {
    scenes.push_back({scene.name, scene.text, scene.zoomKeys});
  }
  for (const auto& entry : std::filesystem::directory_iterator(MAYASCENE_SOURCE_DIR "/examples")) {
    if (entry.path().extension() != ".ma") continue;
    std::ostringstream read;
    read << std::ifstream(entry.path(), std::ios::binary).rdbuf();
    scenes.push_back({entry.path().stem().string(), read.str()});
  }
  return scenes;
}

refhost::HostOptions optionsFor(const SweptScene& scene) {
  refhost::HostOptions options;
  options.zoomKeys = scene.zoomKeys;
  options.during = scene.during;
  if (scene.during != Callback::Import) options.linearUnits = kStoredUnits;
  return options;
}

// What a run without failures calls in the callback that is swept.
struct GoodCalls {
  std::vector<PredictedLine> lines;
  std::vector<std::string> names;  // of the lines' calls
  std::map<std::string, std::int64_t> services;
  HostError code = 0;
};

std::string field(const std::string& line, const std::string& key) {
  const std::string lead = "\"" + key + "\":\"";
  const std::size_t begin = line.find(lead) + lead.size();
  return line.substr(begin, line.find('"', begin) - begin);
}

GoodCalls goodCalls(const SweptScene& scene) {
  Prediction prediction = predict(optionsFor(scene), "/folder/scene.ma", scene.text);
  const PredictedCallback& result = scene.during == Callback::Entry    ? prediction.entry
                                    : scene.during == Callback::Verify ? prediction.verify
                                                                       : prediction.imports.front();
  GoodCalls good;
  good.code = result.code;
  const std::size_t enters = scene.during == Callback::Entry ? 1 : scene.during == Callback::Verify ? 2 : 3;
  std::size_t entered = 0;
  for (const PredictedLine& line : prediction.trace) {
    const std::string name = field(line.text, "call");
    if (name == "enter") {
      ++entered;
    } else if (name != "leave" && entered == enters) {
      good.lines.push_back(line);
      good.names.push_back(name);
    }
  }
  const std::set<std::string> operations(good.names.begin(), good.names.end());
  for (const auto& [name, count] : result.counts) {
    if (operations.count(name) == 0) good.services[name] = count;
  }
  return good;
}

class FailureSweepTest : public ::testing::TestWithParam<SweptScene> {
 protected:
  FailureSweepTest() : good_(goodCalls(GetParam())) {}

  ~FailureSweepTest() override {
    std::printf("%s: %d points walked of %zu calls, %d ended their process\n", GetParam().name.c_str(),
                points_, good_.names.size(), ended_);
    RecordProperty("points", points_);
  }

  void expectAsPredicted(const refhost::HostOptions& options) {
    ++points_;
    const RunReport report = runner_.run(options, "scene.ma", GetParam().text);
    ended_ += report.prediction.processEnds ? 1 : 0;
    EXPECT_EQ(report.disagreement, std::nullopt);
  }

  void expectAsPredicted(std::vector<Failure> failures) {
    refhost::HostOptions options = optionsFor(GetParam());
    options.failures = std::move(failures);
    expectAsPredicted(options);
  }

  // Calls work(number, name) for the calls that are walked and for one more than there are, so that none is
  // missed.
  template <typename Work>
  void forEachCall(Work work) {
    const std::vector<std::string>& names = good_.names;
    const std::size_t stride =
        strideOver(names.size(), names.size() < kLongScene ? kCalls : kCallsOfLongScenes);
    std::set<std::string> met;
    for (std::size_t call = 0; call <= names.size() && !HasFailure(); ++call) {
      const std::string name = call < names.size() ? names[call] : "(none)";
      if (!met.insert(name).second && call % stride != 0) continue;
      SCOPED_TRACE("call " + std::to_string(call + 1) + ": " + name);
      work(static_cast<std::int64_t>(call) + 1);
    }
  }

  // The same for every service: work(service, number, count).
  template <typename Work>
  void forEachServiceCall(Work work) {
    for (const auto& [service, count] : good_.services) {
      const auto stride =
          static_cast<std::int64_t>(strideOver(static_cast<std::size_t>(count), kServiceCalls));
      for (std::int64_t call = 1; call <= count + 1 && !HasFailure();
           call = std::max(call + 1, std::min(call + stride, count + 1))) {
        SCOPED_TRACE(service + " " + std::to_string(call));
        work(service, call, count);
      }
    }
  }

  // Odd, so that of calls that come in pairs both are met.
  static std::size_t strideOver(std::size_t calls, const testsupport::Share& share) {
    if (testsupport::AllTestsWanted()) return 1;
    return ((calls + HowMany(share) - 1) / HowMany(share)) | 1;
  }

  const GoodCalls good_;
  SceneRunner runner_;
  int points_ = 0;
  int ended_ = 0;
};

TEST_P(FailureSweepTest, ACallThatFailsGivesThePredictedTrace) {
  forEachCall([this](std::int64_t nth) {
    expectAsPredicted({{"", nth, false, Failure::Kind::Code, 0}});  // does nothing and says success
    for (const bool onwards : {false, true}) {
      expectAsPredicted({{"", nth, onwards, Failure::Kind::Code, kRehearsed}});
    }
  });
}

TEST_P(FailureSweepTest, AnExceptionOutOfACallGivesThePredictedTraceOrEndsTheProcess) {
  // Endless ones, which take a process each, in turn where the quick tests run.
  const bool all = testsupport::WideTestsWanted();
  forEachCall([this, all](std::int64_t nth) {
    for (std::int64_t i = 0; i < 3; ++i) {
      expectAsPredicted({{"", nth, false, kExceptions[i], 0}});
      if (all || nth % 3 == i) expectAsPredicted({{"", nth, true, kExceptions[i], 0}});
    }
  });
  EXPECT_GT(ended_, 0);
}

TEST_P(FailureSweepTest, ASuiteThatIsRefusedGivesThePredictedTrace) {
  for (std::size_t call = 0; call < good_.names.size(); ++call) {
    if (good_.names[call] != "AcquireSuite") continue;
    const std::string& line = good_.lines[call].text;
    SCOPED_TRACE("refused " + line);
    const std::string lead = "\"version\":";
    refhost::HostOptions options = optionsFor(GetParam());
    options.refusedSuites.push_back(
        {field(line, "suite"), std::stoi(line.substr(line.find(lead) + lead.size()))});
    expectAsPredicted(options);
  }
  EXPECT_GT(points_, 0);
}

TEST_P(FailureSweepTest, AServiceThatFailsGivesThePredictedTrace) {
  forEachServiceCall([this](const std::string& service, std::int64_t nth, std::int64_t count) {
    constexpr std::int64_t kMostFurtherCalls = 16;  // than those of the good run, to clean up
    std::vector<std::pair<Failure::Kind, HostError>> ways = {{Failure::Kind::Code, kRehearsed}};
    for (const Failure::Kind kind : kExceptions) ways.emplace_back(kind, 0);
    expectAsPredicted({{service, nth, false, Failure::Kind::Code, 0}});
    for (const auto& [kind, code] : ways) {
      expectAsPredicted({{service, nth, false, kind, code}});
      std::vector<Failure> onwards;
      for (std::int64_t call = nth; call <= count + kMostFurtherCalls; ++call) {
        onwards.push_back({service, call, false, kind, code});
      }
      expectAsPredicted(onwards);
    }
  });
}

INSTANTIATE_TEST_SUITE_P(Scenes, FailureSweepTest, ::testing::ValuesIn(sweptScenes()),
                         [](const auto& scene) { return scene.param.name; });

TEST(SweptScenesTest, TogetherTheyReachEveryCallAndServiceAndEndWithEveryCodeOfTheImportersOwn) {
  std::set<std::string> reached;
  std::set<HostError> codes;
  for (const SweptScene& scene : sweptScenes()) {
    const GoodCalls good = goodCalls(scene);
    reached.insert(good.names.begin(), good.names.end());
    for (const auto& [service, count] : good.services) reached.insert(service);
    if (scene.during == Callback::Import) codes.insert(good.code);
  }
  // The utility services, but for those of lists, which ListSweepTest has.
  std::set<std::string> expected = {"RegisterStringTable", "StringMake",   "StringCopy",     "StringFormat",
                                    "StripExtension",      "FileCreate",   "FileOpen",       "FileRead",
                                    "FileClose",           "FileSize",     "FileName",       "FileDispose",
                                    "NumberScan",          "RatioCompare", "MatrixDecompose"};
  for (std::size_t operation = 0; operation < refhost::kOperationCount; ++operation) {
    expected.insert(refhost::factsOf(static_cast<refhost::Operation>(operation)).name);
  }
  EXPECT_EQ(reached, expected);
  EXPECT_EQ(codes, (std::set<HostError>{0, HOST_ERR_MAYA_SYNTAX, HOST_ERR_MAYA_UNEXPECTED_END,
                                        HOST_ERR_MAYA_KEY_COUNTS}));
}

}  // namespace
}  // namespace secondreader
