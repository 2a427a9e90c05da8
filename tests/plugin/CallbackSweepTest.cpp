// Every suite call and every utility service of the entry and of the verify callback is made to fail, in
// every way, one after the other.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <csignal>
#include <cstdio>
#include <set>

#include "hostapi/ErrorCodes.h"
#include "plugin/Entry.h"
#include "plugin/Globals.h"
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

// A way to fail, the code that it becomes, and how the trace writes it.
struct Way {
  Failure::Kind kind;
  HostError code;
  const char* error;
};

constexpr Way kCode = {Failure::Kind::Code, kRehearsed, "-77"};
constexpr Way kExceptions[] = {
    {Failure::Kind::BadAlloc, HOST_ERR_EXCEPTION_MEMORY, "\"bad_alloc\""},
    {Failure::Kind::RuntimeError, HOST_ERR_EXCEPTION_OTHER, "\"runtime_error\""},
};

// What a callback is expected to come to.
struct Outcome {
  HostError code = 0;
  bool canImport = false;
  std::vector<std::string> calls;
  HostError reported = 0;  // the code of the one message; 0: there is none
  std::size_t files = 0;   // left behind, because their own end was made to fail
};

std::string WithError(const std::string& line, const std::string& error) {
  return WithoutError(line) + ",\"error\":" + error + "}";
}

std::string WithNull(std::string line, std::string_view key) {
  const std::string_view value = Field(line, key);
  if (value.empty()) return line;
  return line.replace(static_cast<std::size_t>(value.data() - line.data()), value.size(), "null");
}

// The line of a call that fails: it hands nothing out.
std::string Failed(const std::string& line, const std::string& error) {
  const std::string call = CallName(line);
  std::string failed = WithError(line, error);
  if (call == "GetAppPrefsBlob") return WithNull(failed, "store");
  if (call == "GetPrefLong") return WithNull(failed, "value");
  if (call == "RegisterImporterName") return WithNull(failed, "importer");
  return failed;
}

// Without a store the host refuses to look a preference up.
void LoseTheStore(std::vector<std::string>* calls) {
  bool lost = false;
  for (std::string& line : *calls) {
    const std::string call = CallName(line);
    if (call == "GetAppPrefsBlob") lost = !Succeeded(line);
    if (call != "GetPrefLong" || !lost) continue;
    if (Succeeded(line)) line = Failed(line, std::to_string(HOST_ERR_BAD_HANDLE));
    line = WithNull(line, "store");
  }
}

bool Did(const std::vector<std::string>& calls, std::string_view call) {
  const std::vector<std::string> lines = CallsOf(calls, call);
  return !lines.empty() && Succeeded(lines.front());
}

void PrintTo(const Case& swept, std::ostream* out) { *out << swept.name; }

class CallbackSweepTest : public ::testing::TestWithParam<Case> {
 protected:
  CallbackSweepTest() : file_(GetParam().text) {
    const ImportRun run = Run(Options({}));
    good_ = run.trace;
    goodCode_ = run.result.code;
    CheckRun(run, {GetParam().code, GetParam().canImport, good_});
  }

  ~CallbackSweepTest() override {
    std::printf("%s: %d points walked of %zu calls\n", GetParam().name.c_str(), points_, good_.size());
    RecordProperty("points", points_);
  }

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
    EXPECT_THAT(run.result.refusals,
                ::testing::Each(::testing::HasSubstr("GetPrefLong: the preference store")));
    if (GetParam().callback == Callback::Entry) CheckRegistered(*run.host, expected.calls);
  }

  // What was registered before the failure stays, and nothing else is there.
  void CheckRegistered(refhost::Host& host, const std::vector<std::string>& calls) {
    const bool callbacks = Did(calls, "RegisterImporterCallbacks");
    EXPECT_EQ(host.importerName(), Did(calls, "RegisterImporterName") ? "Maya Scene" : "");
    EXPECT_EQ(host.importerExtensions().size(), Did(calls, "RegisterImporterTypes") ? 1u : 0u);
    EXPECT_EQ(host.verifyScene("").code, callbacks ? 0 : HOST_ERR_REGISTRATION);
    EXPECT_EQ(G_use_linear_unitsL, Did(calls, "GetPrefLong") ? kStoredUnits : 0);
    const bool table = Maya_Import_G_zref != nullptr;
    host.unload();
    EXPECT_EQ(Maya_Import_G_zref != nullptr, table && !Did(calls, "RegisterDeathHook"));
    DeathHook(0);
  }

  // A failure after that of the good run changes nothing of its code.
  HostError CodeBehind(const Way& way) const { return goodCode_ != 0 ? goodCode_ : way.code; }

  // What comes of it when call `index` fails, or with `onwards` every call from it on.
  Outcome WhereCallsFail(std::size_t index, const Way& way, bool onwards) const {
    const bool thrown = way.kind != Failure::Kind::Code;
    Outcome outcome;
    outcome.calls.assign(good_.begin(), good_.begin() + static_cast<std::ptrdiff_t>(index));
    std::size_t end = index;  // of the good run: the call whose failure ends it
    while (end < good_.size() && !thrown && IsCodeIgnored(good_, end)) ++end;
    const std::size_t lastFailed = onwards ? end : index;
    if (!onwards && end != index) end = good_.size();
    for (std::size_t i = index; i < end; ++i) {
      outcome.calls.push_back(i <= lastFailed ? Failed(good_[i], way.error) : good_[i]);
    }
    outcome.code = goodCode_;
    outcome.canImport = GetParam().canImport;
    if (end < good_.size()) {
      const bool endsSilence = CallName(good_[end]) == "EndSilentErrors";
      outcome.calls.push_back(Failed(good_[end], way.error));
      for (const std::string& call : HeldAfter(good_, end + 1, true).CleanUp()) {
        outcome.calls.push_back(WithError(call, onwards ? way.error : "0"));
      }
      outcome.code = endsSilence ? CodeBehind(way) : way.code;
      if (!thrown && CallName(good_[end]) == "AcquireSuite") outcome.code = HOST_ERR_MISSING_SUITE;
      outcome.canImport = endsSilence && GetParam().canImport;
      outcome.reported = thrown && !endsSilence ? way.code : 0;  // what is shown while silent is not shown
    }
    LoseTheStore(&outcome.calls);
    return outcome;
  }

  // What comes of it when a service fails behind so many calls of the good run.
  Outcome WhereAServiceFails(const std::string& service, std::size_t place, const Way& way) const {
    const bool thrown = way.kind != Failure::Kind::Code;
    const bool disposal = service == "FileDispose";
    Outcome outcome;
    outcome.calls.assign(good_.begin(), good_.begin() + static_cast<std::ptrdiff_t>(place));
    const HeldByCallback held = HeldAfter(good_, place, false);
    for (const std::string& call : held.CleanUp()) outcome.calls.push_back(WithError(call, "0"));
    const bool behind = disposal || (service == "FileClose" && !thrown);
    outcome.code = behind ? CodeBehind(way) : way.code;
    outcome.canImport = disposal && GetParam().canImport;
    outcome.files = disposal ? 1 : 0;
    outcome.reported = thrown && !held.IsSilent() ? way.code : 0;
    if (service == "RegisterStringTable" && !thrown) outcome.calls = CallsWithoutImporter();
    return outcome;
  }

  // Without its texts the plug-in registers no importer.
  std::vector<std::string> CallsWithoutImporter() const {
    std::vector<std::string> calls = good_;
    std::erase_if(calls, [](const std::string& line) {
      return Field(line, "suite") == "\"QZGP File Import Manager Suite\"";
    });
    return calls;
  }

  void SweepCalls(const Way& way, bool onwards) {
    for (std::size_t index = 0; index < good_.size(); ++index) {
      if (way.kind != Failure::Kind::Code && CallName(good_[index]) == "ReleaseSuiteByName") continue;
      SCOPED_TRACE("call " + std::to_string(index + 1) + ": " + good_[index]);
      Expect(Options(FromCall(index, way, onwards)), WhereCallsFail(index, way, onwards));
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
        Expect(Options(failures), WhereAServiceFails(service, places[first], way));
      }
    }
  }

  // The process ends in the first suite release that throws; before it come the expected calls.
  void ExpectEnd(std::size_t index, const Way& way, bool onwards) {
    ++points_;
    Outcome expected = WhereCallsFail(index, way, onwards);
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
  std::vector<std::string> good_;
  HostError goodCode_ = 0;
  int points_ = 0;
};

TEST_P(CallbackSweepTest, ACallThatFailsGivesItsCodeOrIsIgnored) { SweepCalls(kCode, false); }

TEST_P(CallbackSweepTest, WhereEverythingFailsFromACallOnTheCallbackEndsAllTheSame) {
  SweepCalls(kCode, true);
}

TEST_P(CallbackSweepTest, AStandardExceptionIsReportedOnceAndBecomesItsCode) {
  for (const Way& way : kExceptions) SweepCalls(way, false);
}

TEST_P(CallbackSweepTest, AnExceptionOutOfASuiteReleaseEndsTheProcessThere) {
  for (std::size_t index = 0; index < good_.size(); ++index) {
    if (CallName(good_[index]) != "ReleaseSuiteByName") continue;
    SCOPED_TRACE("call " + std::to_string(index + 1) + ": " + good_[index]);
    for (const Way& way : kExceptions) ExpectEnd(index, way, false);
  }
}

TEST_P(CallbackSweepTest, EndlessExceptionsEndTheProcessAtTheFirstSuiteReleaseOrAreReported) {
  for (std::size_t index = 0; index < good_.size(); ++index) {
    SCOPED_TRACE("from call " + std::to_string(index + 1) + ": " + good_[index]);
    for (const Way& way : kExceptions) ExpectEnd(index, way, true);
  }
}

TEST_P(CallbackSweepTest, ASuiteThatIsRefusedIsThirteen) {
  for (std::size_t index = 0; index < good_.size(); ++index) {
    if (CallName(good_[index]) != "AcquireSuite") continue;
    SCOPED_TRACE("refused " + good_[index]);
    const std::string_view quoted = Field(good_[index], "suite");
    refhost::HostOptions options = Options({});
    options.refusedSuites.push_back({std::string(quoted.substr(1, quoted.size() - 2)),
                                     std::stoi(std::string(Field(good_[index], "version")))});
    const std::string refused = std::to_string(HOST_ERR_SUITE_REFUSED);
    Expect(options, WhereCallsFail(index, {Failure::Kind::Code, kRehearsed, refused.c_str()}, false));
  }
}

TEST_P(CallbackSweepTest, AServiceThatFailsGivesItsCode) {
  SweepServices(kCode, false);
  SweepServices(kCode, true);
}

TEST_P(CallbackSweepTest, AnExceptionOutOfAServiceIsReportedOnceAndBecomesItsCode) {
  for (const Way& way : kExceptions) {
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
    for (const std::string& line : RunCallback(each.callback, file.path()).trace) {
      reached.insert(CallName(line));
    }
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
