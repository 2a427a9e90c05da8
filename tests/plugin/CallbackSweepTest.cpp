// Every suite call and every utility service of the entry and of the verify callback is made to fail, in
// every way, one after the other.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <csignal>
#include <cstdio>
#include <optional>
#include <set>

#include "hostapi/ErrorCodes.h"
#include "plugin/Entry.h"
#include "plugin/Globals.h"
#include "tests/plugin/CallbackModel.h"
#include "tests/support/BuilderRun.h"
#include "tests/support/EndedCallback.h"
#include "tests/support/FailureModel.h"
#include "tests/support/ServicePlaces.h"

namespace testsupport {
namespace {

using refhost::Callback;
using refhost::Failure;
using ::testing::ElementsAreArray;

constexpr HostError kRehearsed = -77;  // no code of the host's or the importer's own
constexpr std::int32_t kStoredUnits = 5;

struct Case {
  std::string name;
  Callback callback;
  std::string text;
  HostError code;  // of the good run
  bool canImport;
};

const std::vector<Case>& Cases() {
  static const std::vector<Case> cases = {
      {"Entry", Callback::Entry, "", 0, false},
      {"VerifyAScene", Callback::Verify, "//Maya ASCII 2020 scene\n", 0, true},
      {"VerifyALetter", Callback::Verify, "This is a letter and not a scene.\n", 0, false},
      {"VerifyAShortFile", Callback::Verify, "//Maya", HOST_ERR_FILE_SHORT_READ, false},
  };
  return cases;
}

constexpr Way kCode = {Failure::Kind::Code, kRehearsed, "-77"};

bool Did(const std::vector<std::string>& calls, std::string_view call) {
  const std::vector<std::string> lines = CallsOf(calls, call);
  return !lines.empty() && Succeeded(lines.front());
}

// What the importer was handed of its preference.
std::int32_t UnitsIn(const std::vector<std::string>& calls) {
  const bool handed = Did(calls, "GetAppPrefsBlob") && Did(calls, "GetPrefLong");
  return handed ? kStoredUnits : 0;
}

void PrintTo(const Case& swept, std::ostream* out) { *out << swept.name; }

class CallbackSweepTest : public ::testing::TestWithParam<Case> {
 protected:
  CallbackSweepTest() : file_(GetParam().text) {
    const ImportRun run = Run(Options({}));
    model_.emplace(run.trace, run.result.code, run.result.canImport);
    CheckRun(run, {GetParam().code, GetParam().canImport, good()});
  }

  ~CallbackSweepTest() override {
    std::printf("%s: %d points walked of %zu calls\n", GetParam().name.c_str(), points_, good().size());
    RecordProperty("points", points_);
  }

  const std::vector<std::string>& good() const { return model_->good(); }

  // In a module that was just loaded.
  static refhost::HostOptions Options(std::vector<Failure> failures) {
    G_use_linear_unitsL = 0;
    refhost::HostOptions options;
    options.linearUnits = kStoredUnits;
    options.failures = std::move(failures);
    return options;
  }

  static std::vector<Failure> FromCall(std::size_t index, const Way& way, bool onwards) {
    return {{"", static_cast<std::int64_t>(index) + 1, onwards, way.kind, way.code}};
  }

  ImportRun Run(refhost::HostOptions options) {
    return RunCallback(GetParam().callback, file_.path(), std::move(options));
  }

  void Expect(refhost::HostOptions options, const Outcome& expected) {
    ++points_;
    const ImportRun run = Run(std::move(options));
    CheckRun(run, expected);
  }

  void CheckRun(const ImportRun& run, const Outcome& expected) {
    EXPECT_EQ(run.result.code, expected.code);
    EXPECT_EQ(run.result.canImport, expected.canImport);
    EXPECT_THAT(run.trace, ElementsAreArray(expected.calls));
    EXPECT_EQ(run.result.messages.size(), expected.reported != 0 ? 1u : 0u);
    for (const std::string& message : run.result.messages) {
      EXPECT_TRUE(message.starts_with(refhost::errorSentence(expected.reported))) << message;
    }
    EXPECT_EQ(run.result.leftovers.size(), MadeBy(expected.calls).leftovers + expected.files);
    for (const refhost::Leftover& left : run.result.leftovers) {
      EXPECT_TRUE(left.keptByDesign) << left.description;
    }
    EXPECT_THAT(run.result.refusals, ::testing::IsEmpty());
    if (GetParam().callback == Callback::Entry) CheckRegistered(*run.host, expected.calls);
  }

  // What was registered before the failure stays, and nothing else is there.
  void CheckRegistered(refhost::Host& host, const std::vector<std::string>& calls) {
    const bool callbacks = Did(calls, "RegisterImporterCallbacks");
    EXPECT_EQ(host.importerName(), Did(calls, "RegisterImporterName") ? "Maya Scene" : "");
    EXPECT_EQ(host.importerExtensions().size(), Did(calls, "RegisterImporterTypes") ? 1u : 0u);
    EXPECT_EQ(host.verifyScene("").code, callbacks ? 0 : HOST_ERR_REGISTRATION);
    EXPECT_EQ(G_use_linear_unitsL, UnitsIn(calls));
    const bool table = Maya_Import_G_zref != nullptr;
    host.unload();
    EXPECT_EQ(Maya_Import_G_zref != nullptr, table && !Did(calls, "RegisterDeathHook"));
    DeathHook(0);
  }

  void SweepCalls(const Way& way, bool onwards) {
    for (std::size_t index = 0; index < good().size(); ++index) {
      if (way.kind != Failure::Kind::Code && CallName(good()[index]) == "ReleaseSuiteByName") continue;
      SCOPED_TRACE("call " + std::to_string(index + 1) + ": " + good()[index]);
      Expect(Options(FromCall(index, way, onwards)), model_->WhereCallsFail(index, way, onwards));
    }
  }

  void SweepServices(const Way& way, bool onwards) {
    constexpr std::size_t kMostFurtherCalls = 4;  // than those of the good run, to clean up
    for (const auto& [service, places] : PlacesOfServices(GetParam().callback, file_.path(), Options({}))) {
      for (std::size_t first = 0; first < places.size(); ++first) {
        SCOPED_TRACE(service + " " + std::to_string(first + 1));
        std::vector<Failure> failures;
        const std::size_t end = onwards ? places.size() + kMostFurtherCalls : first + 1;
        for (std::size_t call = first; call < end; ++call) {
          failures.push_back({service, static_cast<std::int64_t>(call) + 1, false, way.kind, way.code});
        }
        Expect(Options(failures), model_->WhereAServiceFails(service, places[first], way));
      }
    }
  }

  // The process ends in the first suite release that throws; before it come the expected calls.
  void ExpectEnd(std::size_t index, const Way& way, bool onwards) {
    ++points_;
    Outcome expected = model_->WhereCallsFail(index, way, onwards);
    const auto end =
        std::find_if(expected.calls.begin() + static_cast<std::ptrdiff_t>(index), expected.calls.end(),
                     [](const std::string& line) { return CallName(line) == "ReleaseSuiteByName"; });
    const bool ends = end != expected.calls.end();
    if (ends) expected.calls.erase(end + 1, expected.calls.end());
    const EndedCallback ended =
        CallInAProcess(GetParam().callback, file_.path(), Options(FromCall(index, way, onwards)));
    EXPECT_EQ(ended.signal, ends ? SIGABRT : 0);
    EXPECT_EQ(ended.code, ends ? 0 : expected.code);
    EXPECT_THAT(ended.trace, ElementsAreArray(expected.calls));
  }

  const TemporaryFile file_;
  std::optional<CallbackModel> model_;
  int points_ = 0;
};

TEST_P(CallbackSweepTest, ACallThatFailsGivesItsCodeOrIsIgnored) { SweepCalls(kCode, false); }

TEST_P(CallbackSweepTest, WhereEverythingFailsFromACallOnTheCallbackEndsAllTheSame) {
  SweepCalls(kCode, true);
}

TEST_P(CallbackSweepTest, AnExceptionBecomesItsCodeAndAStandardOneIsReportedOnce) {
  for (const Way& way : kAllExceptions) SweepCalls(way, false);
}

TEST_P(CallbackSweepTest, AnExceptionOutOfASuiteReleaseEndsTheProcessThere) {
  for (std::size_t index = 0; index < good().size(); ++index) {
    if (CallName(good()[index]) != "ReleaseSuiteByName") continue;
    SCOPED_TRACE("call " + std::to_string(index + 1) + ": " + good()[index]);
    for (const Way& way : kAllExceptions) ExpectEnd(index, way, false);
  }
}

TEST_P(CallbackSweepTest, EndlessExceptionsEndTheProcessAtTheFirstSuiteReleaseOrAreReported) {
  for (std::size_t index = 0; index < good().size(); ++index) {
    SCOPED_TRACE("from call " + std::to_string(index + 1) + ": " + good()[index]);
    for (const Way& way : kAllExceptions) ExpectEnd(index, way, true);
  }
}

TEST_P(CallbackSweepTest, ASuiteThatIsRefusedIsThirteen) {
  for (std::size_t index = 0; index < good().size(); ++index) {
    if (CallName(good()[index]) != "AcquireSuite") continue;
    SCOPED_TRACE("refused " + good()[index]);
    const std::string_view quoted = Field(good()[index], "suite");
    refhost::HostOptions options = Options({});
    options.refusedSuites.push_back({std::string(quoted.substr(1, quoted.size() - 2)),
                                     std::stoi(std::string(Field(good()[index], "version")))});
    const std::string refused = std::to_string(HOST_ERR_SUITE_REFUSED);
    Expect(options, model_->WhereCallsFail(index, {Failure::Kind::Code, kRehearsed, refused.c_str()}, false));
  }
}

TEST_P(CallbackSweepTest, AServiceThatFailsGivesItsCode) {
  SweepServices(kCode, false);
  SweepServices(kCode, true);
}

TEST_P(CallbackSweepTest, AnExceptionOutOfAServiceBecomesItsCodeAndAStandardOneIsReportedOnce) {
  for (const Way& way : kAllExceptions) {
    SweepServices(way, false);
    SweepServices(way, true);
  }
}

INSTANTIATE_TEST_SUITE_P(Callbacks, CallbackSweepTest, ::testing::ValuesIn(Cases()),
                         [](const auto& swept) { return swept.param.name; });

TEST(CallbackCasesTest, TogetherTheyReachWhatAnImportDoesNotCall) {
  std::set<std::string> reached;
  for (const Case& each : Cases()) {
    const TemporaryFile file(each.text);
    const std::vector<std::string> trace = RunCallback(each.callback, file.path()).trace;
    for (const std::string& line : trace) reached.insert(CallName(line));
    for (const auto& [service, places] : PlacesOfServices(each.callback, file.path())) {
      reached.insert(service);
    }
  }
  const std::set<std::string> expected = {"AcquireSuite",
                                          "ReleaseSuiteByName",
                                          "BeginSilentErrors",
                                          "EndSilentErrors",
                                          "GetAppPrefsBlob",
                                          "GetPrefLong",
                                          "RegisterDeathHook",
                                          "RegisterImporterName",
                                          "RegisterImporterTypes",
                                          "RegisterImporterCallbacks",
                                          "RegisterStringTable",
                                          "StringMake",
                                          "FileCreate",
                                          "FileOpen",
                                          "FileRead",
                                          "FileClose",
                                          "FileDispose"};
  EXPECT_EQ(reached, expected);
}

}  // namespace
}  // namespace testsupport
