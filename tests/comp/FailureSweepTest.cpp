// Every suite call of every small scene is made to fail, in every way, one after the other.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdio>

#include "hostapi/ErrorCodes.h"
#include "tests/comp/FailureScenes.h"
#include "tests/support/FailureModel.h"

namespace testsupport {
namespace {

using ::testing::ElementsAreArray;

constexpr HostError kRehearsed = -77;  // no code of the host's or the importer's own

class FailureSweepTest : public ::testing::TestWithParam<FailureScene> {
 protected:
  FailureSweepTest() : file_(GetParam().text) {
    ImportRun run = ImportFile(file_, Options());
    good_ = run.trace;
    goodCode_ = run.result.code;
    goodMessages_ = run.result.messages;
    CheckHost(run);
  }

  ~FailureSweepTest() override {
    std::printf("%s: %d points walked\n", GetParam().name.c_str(), points_);
    RecordProperty("points", points_);
  }

  refhost::HostOptions Options() const {
    refhost::HostOptions options;
    options.zoomKeys = GetParam().zoomKeys;
    return options;
  }

  // An import in which call `index` (from 0) fails.
  ImportRun Rehearse(std::size_t index, refhost::Failure::Kind kind, HostError code, bool onwards) {
    ++points_;
    refhost::Failure failure;
    failure.nth = static_cast<std::int64_t>(index) + 1;
    failure.onwards = onwards;
    failure.kind = kind;
    failure.code = code;
    refhost::HostOptions options = Options();
    options.failures.push_back(failure);
    return ImportFile(file_, options);
  }

  // The project holds what the trace says, the ledger what it leaves over, and the user saw what was shown.
  // `leftOpen` of it is not kept by design.
  void CheckHost(const ImportRun& run, std::size_t idle = kNoCall, std::size_t reports = 0,
                 std::size_t leftOpen = 0) {
    const Made made = MadeBy(run.trace, idle);
    const refhost::Project& project = run.host->project();
    EXPECT_EQ(project.compositions().size(), made.compositions);
    EXPECT_EQ(project.layers().size(), made.layers);
    std::size_t keys = 0;
    for (const refhost::Layer& layer : project.layers()) {
      for (const refhost::Stream& stream : layer.streams) keys += stream.keyCount();
      if (layer.kind == refhost::LayerKind::Camera) keys -= static_cast<std::size_t>(GetParam().zoomKeys);
    }
    EXPECT_EQ(keys, made.keys);

    constexpr std::size_t kFileObject = 1;
    EXPECT_EQ(run.result.leftovers.size(), made.leftovers + kFileObject);
    EXPECT_EQ(LeftOpen(run.result), leftOpen);

    std::size_t shown = reports;
    for (std::size_t i = 0; i < run.trace.size(); ++i) {
      if (i != idle && CallName(run.trace[i]) == "ShowMessage" && Succeeded(run.trace[i])) ++shown;
    }
    EXPECT_EQ(run.result.messages.size(), shown);
  }

  // The calls before the failure are those of the good run, the calls after it clean up and nothing else.
  void CheckCleanUp(const ImportRun& run, std::size_t index) {
    CheckCalls(run, index, HeldAfter(good_, index + 1, true).CleanUp());
  }

  void CheckCalls(const ImportRun& run, std::size_t index, const std::vector<std::string>& cleanUp) {
    std::vector<std::string> expected = WithoutErrors(good_);
    expected.resize(index + 1);
    expected.insert(expected.end(), cleanUp.begin(), cleanUp.end());
    std::vector<std::string> calls = WithoutErrors(run.trace);
    ASSERT_GT(calls.size(), index);
    calls[index] = expected[index];  // what it would have handed out is null
    EXPECT_THAT(calls, ElementsAreArray(expected));
  }

  void CheckSameCalls(const ImportRun& run) {
    EXPECT_THAT(WithoutErrors(run.trace), ElementsAreArray(WithoutErrors(good_)));
  }

  HostError CodeWhereItIsThrown(std::size_t index) const {
    return CallName(good_[index]) == "AcquireSuite" ? 13 : kRehearsed;
  }

  const TemporaryFile file_;
  std::vector<std::string> good_;
  HostError goodCode_ = 0;
  std::vector<std::string> goodMessages_;
  int points_ = 0;
};

TEST_P(FailureSweepTest, ACallThatFailsGivesItsCodeOrIsIgnored) {
  for (std::size_t index = 0; index < good_.size(); ++index) {
    SCOPED_TRACE("call " + std::to_string(index + 1) + ": " + good_[index]);
    const ImportRun run = Rehearse(index, refhost::Failure::Kind::Code, kRehearsed, false);
    CheckHost(run);
    if (IsCodeIgnored(good_, index)) {
      EXPECT_EQ(run.result.code, goodCode_);
      CheckSameCalls(run);
    } else {
      EXPECT_EQ(run.result.code, CodeWhereItIsThrown(index));
      CheckCleanUp(run, index);
    }
    if (HasFailure()) break;
  }
}

TEST_P(FailureSweepTest, WhereEverythingFailsFromACallOnTheImportEndsAllTheSame) {
  for (std::size_t index = 0; index < good_.size(); ++index) {
    SCOPED_TRACE("from call " + std::to_string(index + 1) + ": " + good_[index]);
    const ImportRun run = Rehearse(index, refhost::Failure::Kind::Code, kRehearsed, true);
    CheckHost(run);
    std::size_t thrown = index;
    while (thrown < good_.size() && IsCodeIgnored(good_, thrown)) ++thrown;
    if (thrown == good_.size()) {
      EXPECT_EQ(run.result.code, goodCode_);
      CheckSameCalls(run);
    } else {
      EXPECT_EQ(run.result.code, CodeWhereItIsThrown(thrown));
      CheckCleanUp(run, thrown);
    }
    if (HasFailure()) break;
  }
}

TEST_P(FailureSweepTest, AStandardExceptionIsReportedOnceAndBecomesItsCode) {
  for (const Way& way : kExceptions) {
    for (std::size_t index = 0; index < good_.size(); ++index) {
      const std::string call = CallName(good_[index]);
      if (call == "ReleaseSuiteByName") continue;  // ends the process: a test of its own
      SCOPED_TRACE("call " + std::to_string(index + 1) + ": " + good_[index]);
      const ImportRun run = Rehearse(index, way.kind, 0, false);
      CheckHost(run, kNoCall, 1);
      if (call == "UnlockMemHandle" || call == "FreeMemHandle") {
        EXPECT_EQ(run.result.code, goodCode_ != 0 ? goodCode_ : way.code);
        CheckSameCalls(run);
      } else {
        EXPECT_EQ(run.result.code, way.code);
        CheckCleanUp(run, index);
      }
      if (HasFailure()) return;
    }
  }
}

TEST_P(FailureSweepTest, AnUnknownExceptionStopsAtTheBorderAndWhatWasOpenStaysOpen) {
  for (std::size_t index = 0; index < good_.size(); ++index) {
    if (CallName(good_[index]) == "ReleaseSuiteByName") continue;  // ends the process: a test of its own
    SCOPED_TRACE("call " + std::to_string(index + 1) + ": " + good_[index]);
    const HeldByCallback held = HeldAfter(good_, index + 1, true);
    const ImportRun run = Rehearse(index, kOther.kind, 0, false);
    EXPECT_EQ(run.result.code, kOther.code);
    CheckHost(run, kNoCall, 0, held.LeftOpen());
    CheckCalls(run, index, held.Unwinding());
    if (HasFailure()) return;
  }
}

// What comes of a call that does nothing, hands out null and gives back 0.
HostError CodeAfterIdle(const std::vector<std::string>& good, std::size_t index, HostError goodCode) {
  const std::string call = CallName(good[index]);
  if (call == "AcquireSuite") return 13;
  if (call == "NewMemHandle") return 0;  // no buffer and no error: there is no text
  if (call == "LockMemHandle") return HOST_ERR_UTILITY_NULL;
  const bool handsOut = call == "CreateComp" || call == "GetItemFromComp" || call == "NewCameraLayer" ||
                        call == "NewNullLayer" || call == "AcquireLayerStream" ||
                        call == "BeginKeyframeBatch";
  if (handsOut) return HOST_ERR_BAD_HANDLE;
  const bool firstKey =
      call == "AddBatchKeyframe" && HeldAfter(good, index, false).IsEmptyBatch(Field(good[index], "batch"));
  return firstKey ? HOST_ERR_BATCH_KEY : goodCode;
}

TEST_P(FailureSweepTest, ACallThatDoesNothingAndSaysSuccessLeavesNothingBehind) {
  for (std::size_t index = 0; index < good_.size(); ++index) {
    SCOPED_TRACE("call " + std::to_string(index + 1) + ": " + good_[index]);
    const ImportRun run = Rehearse(index, refhost::Failure::Kind::Code, 0, false);
    EXPECT_EQ(run.result.code, CodeAfterIdle(good_, index, goodCode_));
    CheckHost(run, index);
    EXPECT_THAT(run.result.messages, ::testing::IsSubsetOf(goodMessages_));
    for (std::size_t i = 0; i < index; ++i) EXPECT_EQ(run.trace[i], good_[i]);
    if (HasFailure()) break;
  }
}

TEST_P(FailureSweepTest, ASuiteThatIsRefusedIsThirteen) {
  for (std::size_t index = 0; index < good_.size(); ++index) {
    if (CallName(good_[index]) != "AcquireSuite") continue;
    ++points_;
    const std::string_view quoted = Field(good_[index], "suite");
    refhost::HostOptions options = Options();
    options.refusedSuites.push_back({std::string(quoted.substr(1, quoted.size() - 2)),
                                     std::stoi(std::string(Field(good_[index], "version")))});
    SCOPED_TRACE("refused " + good_[index]);
    const ImportRun run = ImportFile(file_, options);
    EXPECT_EQ(run.result.code, 13);
    CheckHost(run);
    CheckCleanUp(run, index);
  }
}

TEST_P(FailureSweepTest, AnExceptionOutOfASuiteReleaseEndsTheProcess) {
  for (std::size_t index = 0; index < good_.size(); ++index) {
    if (CallName(good_[index]) != "ReleaseSuiteByName") continue;
    EXPECT_DEATH(Rehearse(index, refhost::Failure::Kind::BadAlloc, 0, false), "bad_alloc") << good_[index];
    EXPECT_DEATH(Rehearse(index, refhost::Failure::Kind::RuntimeError, 0, false), "runtime_error")
        << good_[index];
    EXPECT_DEATH(Rehearse(index, refhost::Failure::Kind::Other, 0, false), "OtherException") << good_[index];
    points_ += 3;
  }
}

INSTANTIATE_TEST_SUITE_P(Scenes, FailureSweepTest, ::testing::ValuesIn(FailureScenes()),
                         [](const auto& scene) { return scene.param.name; });

TEST(FailureScenesTest, TogetherTheyReachEverySuiteCallOfAnImport) {
  std::set<std::string> reached;
  for (const FailureScene& scene : FailureScenes()) {
    refhost::HostOptions options;
    options.zoomKeys = scene.zoomKeys;
    for (const std::string& line : ImportFile(TemporaryFile(scene.text), options).trace) {
      reached.insert(CallName(line));
    }
  }
  const std::set<std::string> expected = {"AcquireSuite",           "ReleaseSuiteByName", "ShowMessage",
                                          "NewMemHandle",           "FreeMemHandle",      "LockMemHandle",
                                          "UnlockMemHandle",        "CreateComp",         "GetItemFromComp",
                                          "NewCameraLayer",         "NewNullLayer",       "AddLayerFromItem",
                                          "SetLayerFlag",           "SetLayerParent",     "SetCameraFilmSize",
                                          "AcquireLayerStream",     "ReleaseStream",      "SetStreamValue",
                                          "GetStreamKeyframeCount", "BeginKeyframeBatch", "AddBatchKeyframe",
                                          "SetBatchKeyframeValue",  "EndKeyframeBatch"};
  EXPECT_EQ(reached, expected);
}

TEST(FailureScenesTest, TogetherTheyEndWithEveryCodeOfTheImportersOwn) {
  std::set<HostError> codes;
  for (const FailureScene& scene : FailureScenes()) codes.insert(ImportText(scene.text).result.code);
  EXPECT_EQ(codes, (std::set<HostError>{0, HOST_ERR_MAYA_SYNTAX, HOST_ERR_MAYA_UNEXPECTED_END,
                                        HOST_ERR_MAYA_KEY_COUNTS}));
}

}  // namespace
}  // namespace testsupport
