// How a child's result reaches its parent, and what replaces one that never came.
#include "tools/mayascene/CheckResult.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <signal.h>

#include <cerrno>
#include <sstream>
#include <string>
#include <vector>

#include "tools/mayascene/CheckChildren.h"

namespace mayascene_test {
namespace {

using mayascene::CheckArguments;
using mayascene::CheckedScene;
using mayascene::CheckResult;
using mayascene::ChildEnd;
using mayascene::ExitStatus;
using mayascene::PoolLimits;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using Kind = ChildEnd::Kind;

std::string sent(const CheckResult& result) {
  std::ostringstream out;
  mayascene::handOver(out, result);
  return out.str();
}

CheckResult someResult() {
  return {.status = ExitStatus::Refused, .totals = "1 error", .report = "a\n\n b\n", .json = "{\n}\n"};
}

TEST(HandedOver, EveryPartOfAResultArrives) {
  CheckResult received;
  ASSERT_TRUE(mayascene::handedOver(sent(someResult()), &received));
  EXPECT_EQ(received.status, ExitStatus::Refused);
  EXPECT_EQ(received.totals, "1 error");
  EXPECT_EQ(received.report, "a\n\n b\n");
  EXPECT_EQ(received.json, "{\n}\n");
  ASSERT_TRUE(mayascene::handedOver(sent({}), &received));
  EXPECT_EQ(received.status, ExitStatus::Unreadable);
  EXPECT_EQ(received.totals + received.report + received.json, "");
}

TEST(HandedOver, WhatIsCutOffAnywhereIsNoResult) {
  const std::string whole = sent(someResult());
  for (std::size_t size = 0; size < whole.size(); ++size) {
    CheckResult received;
    EXPECT_FALSE(mayascene::handedOver(whole.substr(0, size), &received)) << size;
  }
}

TEST(HandedOver, AByteTooManyAndAnotherFormAreNoResult) {
  CheckResult received;
  EXPECT_FALSE(mayascene::handedOver(sent(someResult()) + 'x', &received));
  EXPECT_FALSE(mayascene::handedOver("x" + sent(someResult()), &received));
  for (const char* text :
       {"mayascene-check-result\n", "mayascene-check-result 6 0 0 0\n", "mayascene-check-result 0 0 0\n",
        "mayascene-check-result 0 0 0 0 0\n", "mayascene-check-result 0 0 0 -1\n",
        "mayascene-check-result  0 0 0 0\n", "mayascene-check-result 0 99999999999999999999999 0 0\n"}) {
    EXPECT_FALSE(mayascene::handedOver(text, &received)) << text;
  }
  EXPECT_TRUE(mayascene::handedOver("mayascene-check-result 0 0 0 0\n", &received));
}

class UnfinishedCheck : public ::testing::Test {
 protected:
  CheckedScene unfinished(Kind kind, int number = 0) const {
    ChildEnd end;
    end.kind = kind;
    end.number = number;
    return mayascene::unfinishedCheck("shot.ma", end, limits_);
  }

  // "MA1001: sentence"
  std::string said(Kind kind, int number = 0) const {
    const CheckedScene scene = unfinished(kind, number);
    EXPECT_EQ(scene.report.findings.size(), 1u);
    const diag::Diagnostic& diagnostic = scene.report.findings.at(0).diagnostic;
    return diag::NameOf(diagnostic.code) + ": " + diag::SentenceOf(diagnostic);
  }

  UnfinishedCheck() {
    limits_.timeout = std::chrono::milliseconds(1500);
    limits_.output = std::size_t{3} << 20;
  }

  PoolLimits limits_;
};

TEST_F(UnfinishedCheck, HasOneDiagnosticThatSaysWhatHappened) {
  EXPECT_EQ(said(Kind::TimedOut), "MA1001: the check took longer than 1.5 s and was ended");
  EXPECT_EQ(said(Kind::Signalled, SIGSEGV),
            "MA1002: the check broke off: its process was ended by signal 11 (Segmentation fault)");
  EXPECT_EQ(said(Kind::Exited, 0),
            "MA1002: the check broke off: its process ended with status 0 and without a whole report");
  EXPECT_EQ(said(Kind::Exited, 5), "MA1003: the check needs more memory than there is for one scene");
  EXPECT_EQ(said(Kind::TooMuchOutput), "MA1004: the report is larger than 3 MiB and is not shown");
  EXPECT_EQ(said(Kind::NotStarted, EAGAIN),
            "MA1005: the check could not be started: Resource temporarily unavailable");
}

TEST_F(UnfinishedCheck, IsAnErrorOfTheSceneAndALackOfResourcesOneOfTheRun) {
  for (const Kind kind : {Kind::TimedOut, Kind::Signalled, Kind::Exited, Kind::TooMuchOutput}) {
    EXPECT_EQ(unfinished(kind).status, ExitStatus::Refused);
    EXPECT_EQ(unfinished(kind).report.errors, 1u);
  }
  EXPECT_EQ(unfinished(Kind::NotStarted, EMFILE).status, ExitStatus::CannotWrite);
}

TEST_F(UnfinishedCheck, IsShownWithoutAHead) {
  CheckArguments asked;
  asked.json = "-";
  const CheckResult result = mayascene::resultOf(unfinished(Kind::TimedOut), asked);
  EXPECT_EQ(result.report,
            "shot.ma: error: the check took longer than 1.5 s and was ended [MA1001]\n"
            "help: Give it more time with --timeout. If it never ends, please report it with the scene.\n\n"
            "shot.ma: 1 error, no warnings, no notes\n");
  EXPECT_THAT(result.json, HasSubstr("\"head\": null"));
  EXPECT_THAT(result.json, HasSubstr("\"code\": \"MA1001\""));
  EXPECT_THAT(mayascene::resultOf(unfinished(Kind::TimedOut), CheckArguments{}).json, IsEmpty());
}

// The options of a child have the meaning of those of the run.
TEST(ChildWords, GiveTheChildTheArgumentsOfTheRun) {
  CheckArguments asked;
  asked.twoThreads = true;
  asked.options.all = true;
  asked.options.only = {diag::Code::OpenString, diag::Code::CheckTimedOut};
  asked.strict = true;
  asked.quiet = true;
  asked.json = "report.json";
  asked.host.linearUnits = -1;
  asked.host.preferences = "--odd name";
  asked.colourReport = true;
  const std::vector<std::string> words = mayascene::childWords(asked, "-q");
  std::vector<const char*> pointers;
  for (const std::string& word : words) pointers.push_back(word.c_str());
  std::ostringstream out, err;
  const mayascene::Arguments arguments =
      mayascene::parseArguments(static_cast<int>(pointers.size()), pointers.data(), out, err);
  ASSERT_TRUE(arguments.check) << err.str();
  const CheckArguments& child = *arguments.check;
  EXPECT_TRUE(child.child);
  EXPECT_TRUE(child.twoThreads);
  EXPECT_THAT(child.scenes, ElementsAre("-q"));
  EXPECT_TRUE(child.options.all);
  EXPECT_THAT(child.options.only, ElementsAre(diag::Code::OpenString, diag::Code::CheckTimedOut));
  EXPECT_TRUE(child.strict);
  EXPECT_TRUE(child.quiet);
  EXPECT_EQ(child.json, "-");
  EXPECT_EQ(child.host.linearUnits, -1);
  EXPECT_EQ(child.host.preferences, "--odd name");
  EXPECT_TRUE(child.colourReport);
  EXPECT_FALSE(child.colourComplaints);
}

TEST(ChildWords, HoldNoOptionThatWasNotGiven) {
  EXPECT_THAT(mayascene::childWords({}, "shot.ma"),
              ElementsAre("/proc/self/exe", "check", "--child", "--", "shot.ma"));
}

TEST(ChildLimits, AreThoseOfTheCommandLine) {
  CheckArguments asked;
  EXPECT_GE(mayascene::childLimits(asked).jobs, 1u);
  EXPECT_EQ(mayascene::childLimits(asked).timeout.count(), 60.0);
  asked.jobs = 7;
  asked.timeout = 2.5;
  EXPECT_EQ(mayascene::childLimits(asked).jobs, 7u);
  EXPECT_EQ(mayascene::childLimits(asked).timeout.count(), 2.5);
}

}  // namespace
}  // namespace mayascene_test
