// Every call of every utility service of every small scene is made to fail, in every way, one after the
// other.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <cstdio>

#include "hostapi/ErrorCodes.h"
#include "hostutil/HostSetup.h"
#include "tests/comp/FailureModel.h"
#include "tests/comp/FailureScenes.h"

namespace testsupport {
namespace {

using ::testing::ElementsAreArray;

constexpr HostError kRehearsed = -77;  // no code of the host's or the importer's own

const char* const kServices[] = {
#define SERVICE_NAME(name) #name,
    HOST_UTILITY_TABLE(SERVICE_NAME)
#undef SERVICE_NAME
};

class ServiceSweepTest : public ::testing::TestWithParam<FailureScene> {
 protected:
  ServiceSweepTest() : file_(GetParam().text) {
    ImportRun run = ImportFile(file_, Options());
    good_ = run.trace;
    goodCode_ = run.result.code;
    for (const char* const service : kServices) counts_.push_back(run.host->callCount(service));
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

  // Calls work(service, run) for every call of every service: that call alone fails, or every call from it
  // on.
  template <typename Work>
  void ForEachPoint(refhost::Failure::Kind kind, HostError code, Work work, Extent extent = Extent::Once) {
    constexpr std::int64_t kMostFurtherCalls = 16;  // than those of the good run, to clean up
    for (std::size_t i = 0; i < counts_.size(); ++i) {
      for (std::int64_t nth = 1; nth <= counts_[i] && !HasFailure(); ++nth) {
        ++points_;
        SCOPED_TRACE(std::string(kServices[i]) + " " + std::to_string(nth));
        refhost::HostOptions options = Options();
        const std::int64_t last = extent == Extent::Once ? nth : counts_[i] + kMostFurtherCalls;
        for (std::int64_t call = nth; call <= last; ++call) {
          options.failures.push_back({kServices[i], call, false, kind, code});
        }
        const ImportRun run = ImportFile(file_, options);
        CheckNothingLeft(run, run.host->callCount("FileName") != 0);
        work(std::string_view(kServices[i]), run);
      }
    }
  }

  // A file object that was made is asked for its name.
  void CheckNothingLeft(const ImportRun& run, bool fileObject) {
    EXPECT_EQ(run.result.leftovers.size(), MadeBy(run.trace).leftovers + (fileObject ? 1 : 0));
    for (const refhost::Leftover& left : run.result.leftovers) {
      EXPECT_TRUE(left.keptByDesign) << left.description;
    }
    EXPECT_THAT(run.result.refusals, ::testing::Each(::testing::Not(::testing::HasSubstr("exception"))));
  }

  // The calls are those of the good run up to the failure; then the import cleans up.
  void CheckCleanUp(const ImportRun& run) {
    auto same = static_cast<std::size_t>(
        std::mismatch(good_.begin(), good_.end(), run.trace.begin(), run.trace.end()).first - good_.begin());
    while (same > 0 && EndsTheImport(good_[same - 1])) --same;
    std::vector<std::string> expected(good_.begin(), good_.begin() + static_cast<std::ptrdiff_t>(same));
    expected = WithoutErrors(expected);
    for (std::string& call : HeldAfter(good_, same, false).CleanUp()) expected.push_back(call);
    EXPECT_THAT(WithoutErrors(run.trace), ElementsAreArray(expected));
  }

  // A call that every import ends with.
  static bool EndsTheImport(const std::string& line) {
    const std::string call = CallName(line);
    return call == "ReleaseSuiteByName" || call == "UnlockMemHandle" || call == "FreeMemHandle";
  }

  void SweepCode(Extent extent) {
    const auto check = [&](std::string_view service, const ImportRun& run) {
      EXPECT_EQ(run.result.messages.size(), Shown(run));
      if (service == "StringCopy") {  // a message that does not fit is not shown, and nothing else changes
        EXPECT_EQ(run.result.code, goodCode_);
        EXPECT_EQ(Shown(run), 0u);
      } else {
        EXPECT_EQ(run.result.code, kRehearsed);
        CheckCleanUp(run);
      }
    };
    ForEachPoint(refhost::Failure::Kind::Code, kRehearsed, check, extent);
  }

  void SweepExceptions(Extent extent) {
    for (const auto& [kind, code] :
         {std::pair{refhost::Failure::Kind::BadAlloc, HostError{HOST_ERR_EXCEPTION_MEMORY}},
          std::pair{refhost::Failure::Kind::RuntimeError, HostError{HOST_ERR_EXCEPTION_OTHER}}}) {
      const HostError expected = code;
      const auto check = [&](std::string_view, const ImportRun& run) {
        EXPECT_EQ(run.result.code, expected);
        EXPECT_EQ(run.result.messages.size(), Shown(run) + 1);
        CheckCleanUp(run);
      };
      ForEachPoint(kind, 0, check, extent);
    }
  }

  std::size_t Shown(const ImportRun& run) { return CallsOf(run.trace, "ShowMessage").size(); }

  const TemporaryFile file_;
  std::vector<std::string> good_;
  HostError goodCode_ = 0;
  std::vector<std::int64_t> counts_;
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

TEST_P(ServiceSweepTest, AServiceThatDoesNothingAndSaysSuccessGivesNoUnknownCode) {
  ForEachPoint(refhost::Failure::Kind::Code, 0, [&](std::string_view service, const ImportRun& run) {
    const HostError code = run.result.code;
    EXPECT_TRUE(code == 0 || !refhost::errorName(code).empty()) << code;
    // A list that counts nothing, though it holds records, is an exception where it is indexed.
    EXPECT_EQ(run.result.messages.size(), Shown(run) + (code == HOST_ERR_EXCEPTION_OTHER ? 1 : 0));
    EXPECT_TRUE(service != "FileCreate" || code == HOST_ERR_NULL_ARGUMENT) << code;  // no file object
  });
}

INSTANTIATE_TEST_SUITE_P(Scenes, ServiceSweepTest, ::testing::ValuesIn(FailureScenes()),
                         [](const auto& scene) { return scene.param.name; });

}  // namespace
}  // namespace testsupport
