// Every suite call of every example scene is made to fail, one after the other: once, and from there on for
// ever.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdio>
#include <set>
#include <string>
#include <vector>

#include "hostapi/ErrorCodes.h"
#include "tests/comp/SweptImport.h"
#include "tests/support/ServicePlaces.h"

namespace testsupport {
namespace {

using refhost::Failure;

constexpr HostError kRehearsed = -77;  // no code of the host's or the importer's own
constexpr const char* kRehearsedText = "-77";
constexpr std::size_t kFileObject = 1;

class ExampleSweepTest : public ::testing::TestWithParam<std::string> {
 protected:
  ExampleSweepTest() : import_(ExampleScene(GetParam())), walked_(WalkedCalls(import_.good())) {}

  ~ExampleSweepTest() override {
    std::printf("%s: %d points walked of %zu calls\n", GetParam().c_str(), points_, import_.good().size());
    RecordProperty("points", points_);
  }

  SweptRun Rehearse(std::size_t index, Failure::Kind kind, HostError code, bool onwards) {
    ++points_;
    refhost::HostOptions options;
    options.failures.push_back({"", static_cast<std::int64_t>(index) + 1, onwards, kind, code});
    return import_.Run(options);
  }

  // Calls work(cursor) for every call, or for the share of them that is walked.
  template <typename Work>
  void ForEachCall(Work work) {
    for (SweepCursor cursor(import_); !cursor.isAtEnd() && !HasFailure(); cursor.Next()) {
      if (!walked_[cursor.index()]) continue;
      SCOPED_TRACE("call " + std::to_string(cursor.index() + 1) + ": " + cursor.line());
      work(cursor);
    }
  }

  // The calls before the failure are those of the good run; then come the call `thrown`, whose failure ends
  // the import, and the calls that clean up.
  void ExpectEndedAt(const SweptRun& run, const SweepCursor& cursor, std::size_t thrown,
                     const std::string& error, bool onwards) {
    const std::vector<std::string>& good = import_.good();
    std::string expected(import_.FirstCalls(cursor.index()));
    HeldByCallback held = cursor.held();
    for (std::size_t i = cursor.index(); i < thrown; ++i) {
      held.Take(good[i], true);
      expected += WithErrors({WithoutError(good[i])}, error);
    }
    held.Take(good[thrown], true);
    const std::vector<std::string> cleanUp = held.CleanUp();
    ExpectCalls(run, expected, CallName(good[thrown]), error, WithErrors(cleanUp, onwards ? error : "0"));
    ExpectHeld(run, onwards ? cursor.made() : cursor.madeAfter(cleanUp));
  }

  // The calls `before`, then the one that fails, whatever it would have handed out, then the calls `after`.
  static void ExpectCalls(const SweptRun& run, std::string_view before, std::string_view failing,
                          std::string_view error, std::string_view after) {
    ASSERT_GE(run.calls.size(), before.size() + after.size());
    EXPECT_EQ(run.calls.compare(0, before.size(), before), 0);
    const std::string_view rest = std::string_view(run.calls).substr(before.size());
    const std::string_view failed = rest.substr(0, rest.find('\n'));
    EXPECT_EQ(CallName(failed), failing);
    EXPECT_EQ(Field(failed, "error"), error);
    EXPECT_EQ(rest.substr(failed.size() + 1), after);
  }

  // One failing call changes nothing of the others.
  void ExpectGoneOn(const SweptRun& run, std::size_t index, const std::string& error) {
    std::string expected(import_.FirstCalls(index));
    expected += WithErrors({WithoutError(import_.good()[index])}, error);
    expected += import_.CallsFrom(index + 1);
    EXPECT_TRUE(run.calls == expected);
    ExpectHeld(run, import_.MadeWithout(index));
  }

  void ExpectHeld(const SweptRun& run, Made made) {
    made.leftovers += kFileObject;
    const bool reported =
        run.result.code == HOST_ERR_EXCEPTION_MEMORY || run.result.code == HOST_ERR_EXCEPTION_OTHER;
    ExpectMade(run, made, reported ? 1 : 0);
  }

  static HostError CodeWhereItIsThrown(const std::string& line) {
    return CallName(line) == "AcquireSuite" ? HOST_ERR_MISSING_SUITE : kRehearsed;
  }

  const SweptImport import_;
  const std::vector<bool> walked_;
  int points_ = 0;
};

TEST_P(ExampleSweepTest, OfEveryOperationACallIsWalked) {
  std::set<std::string> there;
  std::set<std::string> walked;
  for (const std::string& line : import_.good()) there.insert(CallName(line));
  ForEachCall([&](const SweepCursor& cursor) { walked.insert(CallName(cursor.line())); });
  EXPECT_EQ(walked, there);
}

TEST_P(ExampleSweepTest, ACallThatFailsGivesItsCodeOrIsIgnored) {
  ForEachCall([this](const SweepCursor& cursor) {
    const SweptRun run = Rehearse(cursor.index(), Failure::Kind::Code, kRehearsed, false);
    if (IsCodeIgnored(cursor.line(), cursor.held())) {
      EXPECT_EQ(run.result.code, 0);
      ExpectGoneOn(run, cursor.index(), kRehearsedText);
    } else {
      EXPECT_EQ(run.result.code, CodeWhereItIsThrown(cursor.line()));
      ExpectEndedAt(run, cursor, cursor.index(), kRehearsedText, false);
    }
  });
}

TEST_P(ExampleSweepTest, WhereEverythingFailsFromACallOnTheImportEndsAllTheSame) {
  const std::vector<std::string>& good = import_.good();
  ForEachCall([&](const SweepCursor& cursor) {
    const SweptRun run = Rehearse(cursor.index(), Failure::Kind::Code, kRehearsed, true);
    SweepCursor thrown = cursor;
    while (!thrown.isAtEnd() && IsCodeIgnored(thrown.line(), thrown.held())) thrown.Next();
    if (thrown.isAtEnd()) {
      std::vector<std::string> failing;
      for (std::size_t i = cursor.index(); i < good.size(); ++i) failing.push_back(WithoutError(good[i]));
      EXPECT_EQ(run.result.code, 0);
      EXPECT_TRUE(run.calls ==
                  std::string(import_.FirstCalls(cursor.index())) + WithErrors(failing, kRehearsedText));
      ExpectHeld(run, cursor.made());
    } else {
      EXPECT_EQ(run.result.code, CodeWhereItIsThrown(thrown.line()));
      ExpectEndedAt(run, cursor, thrown.index(), kRehearsedText, true);
    }
  });
}

TEST_P(ExampleSweepTest, AStandardExceptionIsReportedOnceAndBecomesItsCode) {
  for (const Way& exception : kExceptions) {
    ForEachCall([&](const SweepCursor& cursor) {
      const std::string call = CallName(cursor.line());
      if (call == "ReleaseSuiteByName") return;  // ends the process: a test of its own
      const SweptRun run = Rehearse(cursor.index(), exception.kind, 0, false);
      EXPECT_EQ(run.result.code, exception.code);
      if (call == "UnlockMemHandle" || call == "FreeMemHandle") {
        ExpectGoneOn(run, cursor.index(), exception.error);
      } else {
        ExpectEndedAt(run, cursor, cursor.index(), exception.error, false);
      }
    });
  }
}

TEST_P(ExampleSweepTest, AnUnknownExceptionStopsAtTheBorderAndWhatWasOpenStaysOpen) {
  ForEachCall([&](const SweepCursor& cursor) {
    const std::string call = CallName(cursor.line());
    if (call == "ReleaseSuiteByName") return;  // ends the process: a test of its own
    const SweptRun run = Rehearse(cursor.index(), kOther.kind, 0, false);
    EXPECT_EQ(run.result.code, kOther.code);
    HeldByCallback held = cursor.held();
    held.Take(cursor.line(), true);
    const std::vector<std::string> unwinding = held.Unwinding();
    ExpectCalls(run, import_.FirstCalls(cursor.index()), call, kOther.error, WithErrors(unwinding, "0"));
    Made made = cursor.madeAfter(unwinding);
    made.leftovers += kFileObject;
    ExpectMade(run, made, 0, held.LeftOpen());
  });
}

TEST_P(ExampleSweepTest, ASuiteThatIsRefusedIsThirteen) {
  for (SweepCursor cursor(import_); !cursor.isAtEnd(); cursor.Next()) {
    if (CallName(cursor.line()) != "AcquireSuite") continue;
    SCOPED_TRACE("refused " + cursor.line());
    ++points_;
    const std::string_view quoted = Field(cursor.line(), "suite");
    refhost::HostOptions options;
    options.refusedSuites.push_back({std::string(quoted.substr(1, quoted.size() - 2)),
                                     std::stoi(std::string(Field(cursor.line(), "version")))});
    const SweptRun run = import_.Run(options);
    EXPECT_EQ(run.result.code, HOST_ERR_MISSING_SUITE);
    ExpectEndedAt(run, cursor, cursor.index(), std::to_string(HOST_ERR_SUITE_REFUSED), false);
  }
}

// A list that counts nothing, though it holds records, is an exception where it is indexed; so only codes
// other than 0 are rehearsed here.
TEST_P(ExampleSweepTest, AUtilityServiceThatFailsGivesItsCodeAndAnExceptionIsReportedOnce) {
  std::vector<std::string> cleanUps;
  std::vector<Made> made;
  for (SweepCursor cursor(import_);; cursor.Next()) {
    const std::vector<std::string> cleanUp = cursor.held().CleanUp();
    cleanUps.push_back(WithErrors(cleanUp, "0"));
    made.push_back(cursor.madeAfter(cleanUp));
    if (cursor.isAtEnd()) break;
  }
  std::vector<Way> ways = {{Failure::Kind::Code, kRehearsed, kRehearsedText}};
  ways.insert(ways.end(), std::begin(kExceptions), std::end(kExceptions));
  for (const auto& [service, places] :
       PlacesOfServices(refhost::Callback::Import, ExampleScene(GetParam()))) {
    const std::size_t stride = SweepStride(places.size(), kSmallShare);
    for (std::size_t call = 0; call < places.size() && !HasFailure(); call += stride) {
      const std::size_t place = places[call];
      for (const Way& way : ways) {
        SCOPED_TRACE(service + " " + std::to_string(call + 1));
        ++points_;
        refhost::HostOptions options;
        options.failures.push_back({service, static_cast<std::int64_t>(call) + 1, false, way.kind, way.code});
        const SweptRun run = import_.Run(options);
        EXPECT_EQ(run.result.code, way.code);
        EXPECT_TRUE(run.calls == std::string(import_.FirstCalls(place)) + cleanUps[place]);
        Made expected = made[place];
        expected.leftovers += run.host->callCount("FileName") != 0 ? kFileObject : 0;
        ExpectMade(run, expected, way.kind == Failure::Kind::Code ? 0 : 1);
      }
    }
  }
}

INSTANTIATE_TEST_SUITE_P(Examples, ExampleSweepTest, ::testing::ValuesIn(ExampleNames()),
                         [](const auto& example) { return example.param; });

}  // namespace
}  // namespace testsupport
