// Every call of every list service of every small scene is made to fail, in every way, one after the other.
// The second reader keeps no lists: for it the failure comes between the two suite calls where the list's
// call lies.
#include <gtest/gtest.h>

#include <cstdio>
#include <set>
#include <string>
#include <vector>

#include "hostapi/ErrorCodes.h"
#include "tests/secondreader/FailurePlan.h"
#include "tests/secondreader/FailureScenes.h"
#include "tests/secondreader/SceneRun.h"
#include "tests/support/BuilderRun.h"
#include "tests/support/ServicePlaces.h"

namespace secondreader {
namespace {

using refhost::Callback;
using refhost::Failure;
using testsupport::FailureScene;
using testsupport::FailureScenes;
using testsupport::ImportRun;
using testsupport::ServicePlaces;

constexpr HostError kRehearsed = -77;          // no code of the host's or the importer's own
constexpr std::size_t kMostFurtherCalls = 16;  // than those of a run without failures, to clean up

bool IsList(const std::string& service) { return service.starts_with("List"); }

class ListSweepTest : public ::testing::TestWithParam<FailureScene> {
 protected:
  ListSweepTest()
      : file_(GetParam().text),
        places_(testsupport::PlacesOfServices(Callback::Import, file_.path(), Options())) {
    std::erase_if(places_, [](const auto& entry) { return !IsList(entry.first); });
    const ImportRun good = testsupport::ImportFile(file_, Options());
    goodMessages_.insert(good.result.messages.begin(), good.result.messages.end());
    for (const auto& [service, places] : places_) {
      EXPECT_EQ(good.host->callCount(service), static_cast<std::int64_t>(places.size())) << service;
    }
  }

  ~ListSweepTest() override {
    std::printf("%s: %d points walked\n", GetParam().name.c_str(), points_);
    RecordProperty("points", points_);
  }

  refhost::HostOptions Options() const {
    refhost::HostOptions options;
    options.zoomKeys = GetParam().zoomKeys;
    return options;
  }

  // Calls work(service, number, place) for every call of every list service: so many suite calls come before
  // it.
  template <typename Work>
  void ForEachPoint(Work work) {
    for (const auto& [service, places] : places_) {
      for (std::size_t call = 0; call < places.size() && !HasFailure(); ++call) {
        ++points_;
        SCOPED_TRACE(service + " " + std::to_string(call + 1));
        work(service, call + 1, places[call]);
      }
    }
  }

  // That call alone fails, or every call from it on: the import ends at once either way.
  void ExpectAsPredicted(Failure::Kind kind, HostError code) {
    ForEachPoint([&](const std::string& service, std::size_t number, std::size_t place) {
      refhost::HostOptions predicted = Options();
      predicted.failures = {{kBetweenCalls, static_cast<std::int64_t>(place), false, kind, code}};
      for (const std::size_t last : {number, places_.at(service).size() + kMostFurtherCalls}) {
        refhost::HostOptions options = Options();
        for (std::size_t call = number; call <= last; ++call)
          options.failures.push_back({service, static_cast<std::int64_t>(call), false, kind, code});
        EXPECT_EQ(runner_.run(options, predicted, "shot01.ma", GetParam().text).disagreement, std::nullopt);
      }
    });
  }

  const testsupport::TemporaryFile file_;
  ServicePlaces places_;
  std::set<std::string> goodMessages_;
  SceneRunner runner_;
  int points_ = 0;
};

TEST_P(ListSweepTest, AListThatFailsGivesItsCodeAndThePredictedTrace) {
  ExpectAsPredicted(Failure::Kind::Code, kRehearsed);
}

TEST_P(ListSweepTest, AnExceptionOutOfAListGivesThePredictedTrace) {
  ExpectAsPredicted(Failure::Kind::BadAlloc, 0);
  ExpectAsPredicted(Failure::Kind::RuntimeError, 0);
  ExpectAsPredicted(Failure::Kind::Other, 0);
}

// What is built then depends on the content of the list, which is not predicted.
TEST_P(ListSweepTest, AListThatDoesNothingAndSaysSuccessGivesNoUnknownCodeAndShowsNothingElse) {
  ForEachPoint([this](const std::string& service, std::size_t number, std::size_t) {
    refhost::HostOptions options = Options();
    options.failures = {{service, static_cast<std::int64_t>(number), false, Failure::Kind::Code, 0}};
    const ImportRun run = testsupport::ImportFile(file_, options);
    const HostError code = run.result.code;
    EXPECT_TRUE(code == 0 || !refhost::errorName(code).empty()) << code;
    for (const std::string& message : run.result.messages) {
      // A list that counts nothing, though it holds records, is an exception where it is indexed.
      const bool reported =
          code == HOST_ERR_EXCEPTION_OTHER && message.starts_with(refhost::errorSentence(code));
      EXPECT_TRUE(reported || goodMessages_.contains(message)) << message;
    }
    for (const refhost::Leftover& leftover : run.result.leftovers) {
      EXPECT_TRUE(leftover.keptByDesign) << leftover.description;
    }
    EXPECT_EQ(std::set<std::string>(run.result.refusals.begin(), run.result.refusals.end())
                  .count("an exception left the plug-in"),
              0u);
  });
}

INSTANTIATE_TEST_SUITE_P(Scenes, ListSweepTest, ::testing::ValuesIn(FailureScenes()),
                         [](const auto& scene) { return scene.param.name; });

TEST(ListScenesTest, TogetherTheyReachEveryListService) {
  std::set<std::string> reached;
  for (const FailureScene& scene : FailureScenes()) {
    const testsupport::TemporaryFile file(scene.text);
    for (const auto& [service, places] : testsupport::PlacesOfServices(Callback::Import, file.path())) {
      if (IsList(service)) reached.insert(service);
    }
  }
  const std::vector<std::string>& all = testsupport::ServiceNames();
  std::set<std::string> expected(all.begin(), all.end());
  std::erase_if(expected, [](const std::string& service) { return !IsList(service); });
  EXPECT_EQ(reached, expected);
}

}  // namespace
}  // namespace secondreader
