// Every call of every list service of every small scene is made to fail, in every way, one after the other.
// The second reader plays no lists; it sweeps all other services.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdio>
#include <set>

#include "hostapi/ErrorCodes.h"
#include "tests/secondreader/FailureScenes.h"
#include "tests/support/FailureModel.h"
#include "tests/support/ServicePlaces.h"

namespace testsupport {
namespace {

using ::testing::ElementsAreArray;

constexpr HostError kRehearsed = -77;  // no code of the host's or the importer's own

class ServiceSweepTest : public ::testing::TestWithParam<FailureScene> {
 protected:
  ServiceSweepTest()
      : file_(GetParam().text),
        places_(PlacesOfServices(refhost::Callback::Import, file_.path(), Options())) {
    const ImportRun run = ImportFile(file_, Options());
    good_ = run.trace;
    goodMessages_ = run.result.messages;
    std::erase_if(places_, [](const auto& entry) { return !entry.first.starts_with("List"); });
    for (const auto& [service, places] : places_) {
      EXPECT_EQ(run.host->callCount(service), static_cast<std::int64_t>(places.size())) << service;
    }
  }

  ~ServiceSweepTest() override {
    std::printf("%s: %d points walked\n", GetParam().name.c_str(), points_);
    RecordProperty("points", points_);
  }

  refhost::HostOptions Options() const {
    refhost::HostOptions options;
    options.zoomKeys = GetParam().zoomKeys;
    return options;
  }

  enum class Extent { Once, Onwards };

  // Calls work(service, place, run) for every call of every service, which has a place between the suite
  // calls of the good run: that call alone fails, or every call from it on.
  template <typename Work>
  void ForEachPoint(refhost::Failure::Kind kind, HostError code, Work work, Extent extent = Extent::Once) {
    constexpr std::size_t kMostFurtherCalls = 16;  // than those of the good run, to clean up
    for (const auto& [service, places] : places_) {
      for (std::size_t first = 0; first < places.size() && !HasFailure(); ++first) {
        ++points_;
        SCOPED_TRACE(service + " " + std::to_string(first + 1));
        refhost::HostOptions options = Options();
        const std::size_t end = extent == Extent::Once ? first + 1 : places.size() + kMostFurtherCalls;
        for (std::size_t call = first; call < end; ++call) {
          options.failures.push_back({service, static_cast<std::int64_t>(call) + 1, false, kind, code});
        }
        const ImportRun run = ImportFile(file_, options);
        work(service, places[first], run);
        // A file object that was made is asked for its name, unless an unknown exception came before.
        const bool unknown = kind == refhost::Failure::Kind::Other;
        const bool fileObject = unknown ? service != "FileCreate" && run.host->callCount("FileCreate") != 0
                                        : run.host->callCount("FileName") != 0;
        const std::size_t leftOpen = unknown ? HeldAfter(good_, places[first], false).LeftOpen() : 0;
        CheckLeft(run, fileObject, leftOpen);
      }
    }
  }

  void CheckLeft(const ImportRun& run, bool fileObject, std::size_t leftOpen) {
    EXPECT_EQ(run.result.leftovers.size(), MadeBy(run.trace).leftovers + (fileObject ? 1 : 0));
    EXPECT_EQ(LeftOpen(run.result), leftOpen);
    EXPECT_THAT(run.result.refusals, ::testing::Each(::testing::Not(::testing::HasSubstr("exception"))));
  }

  // The calls are those of the good run up to the failure; then the import cleans up.
  void CheckCleanUp(const ImportRun& run, std::size_t place) {
    CheckCalls(run, place, HeldAfter(good_, place, false).CleanUp());
  }

  void CheckCalls(const ImportRun& run, std::size_t place, const std::vector<std::string>& cleanUp) {
    std::vector<std::string> expected(good_.begin(), good_.begin() + static_cast<std::ptrdiff_t>(place));
    expected = WithoutErrors(expected);
    expected.insert(expected.end(), cleanUp.begin(), cleanUp.end());
    EXPECT_THAT(WithoutErrors(run.trace), ElementsAreArray(expected));
  }

  void SweepCode(Extent extent) {
    const auto check = [&](std::string_view, std::size_t place, const ImportRun& run) {
      EXPECT_EQ(run.result.messages.size(), Shown(run));
      EXPECT_EQ(run.result.code, kRehearsed);
      CheckCleanUp(run, place);
    };
    ForEachPoint(refhost::Failure::Kind::Code, kRehearsed, check, extent);
  }

  void SweepExceptions(Extent extent) {
    for (const Way& way : kExceptions) {
      const auto check = [&](std::string_view, std::size_t place, const ImportRun& run) {
        EXPECT_EQ(run.result.code, way.code);
        EXPECT_EQ(run.result.messages.size(), Shown(run) + 1);
        CheckCleanUp(run, place);
      };
      ForEachPoint(way.kind, 0, check, extent);
    }
  }

  void SweepUnknownExceptions(Extent extent) {
    const auto check = [&](std::string_view, std::size_t place, const ImportRun& run) {
      EXPECT_EQ(run.result.code, kOther.code);
      EXPECT_EQ(run.result.messages.size(), Shown(run));
      CheckCalls(run, place, HeldAfter(good_, place, false).Unwinding());
    };
    ForEachPoint(kOther.kind, 0, check, extent);
  }

  std::size_t Shown(const ImportRun& run) { return CallsOf(run.trace, "ShowMessage").size(); }

  const TemporaryFile file_;
  ServicePlaces places_;
  std::vector<std::string> good_;
  std::vector<std::string> goodMessages_;
  int points_ = 0;
};

TEST_P(ServiceSweepTest, AServiceThatFailsGivesItsCode) { SweepCode(Extent::Once); }

TEST_P(ServiceSweepTest, AServiceThatFailsForEverGivesItsCode) { SweepCode(Extent::Onwards); }

TEST_P(ServiceSweepTest, AnExceptionOutOfAServiceIsReportedOnceAndBecomesItsCode) {
  SweepExceptions(Extent::Once);
}

TEST_P(ServiceSweepTest, EndlessExceptionsOutOfAServiceAreReportedOnceAndBecomeTheirCode) {
  SweepExceptions(Extent::Onwards);
}

TEST_P(ServiceSweepTest, AnUnknownExceptionOutOfAServiceStopsAtTheBorderAndWhatWasOpenStaysOpen) {
  SweepUnknownExceptions(Extent::Once);
}

TEST_P(ServiceSweepTest, EndlessUnknownExceptionsOutOfAServiceStopAtTheBorder) {
  SweepUnknownExceptions(Extent::Onwards);
}

TEST_P(ServiceSweepTest, AServiceThatDoesNothingAndSaysSuccessGivesNoUnknownCodeAndShowsNothingElse) {
  const auto check = [&](std::string_view, std::size_t, const ImportRun& run) {
    const HostError code = run.result.code;
    EXPECT_TRUE(code == 0 || !refhost::errorName(code).empty()) << code;
    std::vector<std::string> shown = run.result.messages;
    // A list that counts nothing, though it holds records, is an exception where it is indexed, and reported.
    if (code == HOST_ERR_EXCEPTION_OTHER) {
      ASSERT_FALSE(shown.empty());
      EXPECT_TRUE(shown.back().starts_with(refhost::errorSentence(code))) << shown.back();
      shown.pop_back();
    }
    EXPECT_EQ(shown.size(), Shown(run));
    EXPECT_THAT(shown, ::testing::IsSubsetOf(goodMessages_));
  };
  ForEachPoint(refhost::Failure::Kind::Code, 0, check);
}

INSTANTIATE_TEST_SUITE_P(Scenes, ServiceSweepTest, ::testing::ValuesIn(FailureScenes()),
                         [](const auto& scene) { return scene.param.name; });

TEST(FailureScenesTest, TogetherTheyReachEveryListService) {
  std::set<std::string> reached;
  for (const FailureScene& scene : FailureScenes()) {
    const TemporaryFile file(scene.text);
    for (const auto& [service, places] : PlacesOfServices(refhost::Callback::Import, file.path())) {
      if (service.starts_with("List")) reached.insert(service);
    }
  }
  std::set<std::string> expected(ServiceNames().begin(), ServiceNames().end());
  std::erase_if(expected, [](const std::string& service) { return !service.starts_with("List"); });
  EXPECT_EQ(reached, expected);
}

}  // namespace
}  // namespace testsupport
