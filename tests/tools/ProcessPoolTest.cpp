// Children that hang, crash, take too much or cannot be started, and the others beside them.
#include "tools/mayascene/ProcessPool.h"

#include <gtest/gtest.h>
#include <signal.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <filesystem>
#include <fstream>
#include <functional>
#include <map>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

#include "tests/support/OwnProcess.h"
#include "tests/support/TemporaryFolder.h"

namespace mayascene_test {
namespace {

using mayascene::ChildEnd;
using mayascene::PoolLimits;
using mayascene::PoolState;
using mayascene::ProcessPool;
using Kind = ChildEnd::Kind;
using Words = std::vector<std::string>;

constexpr rlim_t kDescriptorsOfAProgram = 64;  // more than a test program has open
constexpr uid_t kNobody = 65534;

std::size_t openDescriptors() {
  std::size_t count = 0;
  for (const auto& entry : std::filesystem::directory_iterator("/proc/self/fd"))
    count += entry.exists() ? 1 : 1;
  return count;
}

class Pool : public ::testing::Test {
 protected:
  // Runs the children, each with its command, and gives their ends in the order in which they
  // came.
  std::vector<ChildEnd> run(const std::vector<Words>& children) {
    std::vector<ChildEnd> ends;
    numbers_.clear();
    ProcessPool pool(limits_);
    pool.run(
        children.size(),
        [&](std::size_t number) {
          Words words = {program_};
          words.insert(words.end(), children.at(number).begin(), children.at(number).end());
          return words;
        },
        [&](std::size_t number, ChildEnd end) {
          numbers_.push_back(number);
          ends.push_back(std::move(end));
          return ends.size() < wanted_;
        },
        [&](const PoolState& state) {
          states_.push_back(state);
          if (watch_) watch_(state, ends.size());
        });
    return ends;
  }

  std::string path(const std::string& name) const { return (folder_.path() / name).string(); }

  testsupport::TemporaryFolder folder_;
  std::string program_ = MISBEHAVING_CHILD;
  PoolLimits limits_;
  std::size_t wanted_ = 1000;         // results, after which no more are taken
  std::vector<std::size_t> numbers_;  // of the ends
  std::vector<PoolState> states_;
  std::function<void(const PoolState&, std::size_t handedOut)> watch_;
};

TEST_F(Pool, BothStreamsAndTheStatusOfAChildComeBack) {
  const auto ends = run({{"say", "report", "end", "3"}});
  ASSERT_EQ(ends.size(), 1u);
  EXPECT_EQ(ends[0].kind, Kind::Exited);
  EXPECT_EQ(ends[0].number, 3);
  EXPECT_EQ(ends[0].out, "report");
  EXPECT_EQ(ends[0].err, "3");
}

TEST_F(Pool, NoChildrenAreNoWork) { EXPECT_TRUE(run({}).empty()); }

TEST_F(Pool, AChildReadsNothing) { EXPECT_EQ(run({{"read"}}).at(0).out, "0"); }

// Each child but the last waits for the one after it.
TEST_F(Pool, ResultsComeInTheOrderOfTheChildrenWhateverOrderTheyEndIn) {
  limits_.jobs = 4;
  const auto ends = run({{"await", path("1"), "say", "a"},
                         {"await", path("2"), "make", path("1"), "say", "b"},
                         {"await", path("3"), "make", path("2"), "say", "c"},
                         {"make", path("3"), "say", "d"}});
  ASSERT_EQ(ends.size(), 4u);
  EXPECT_EQ(numbers_, (std::vector<std::size_t>{0, 1, 2, 3}));
  EXPECT_EQ(ends[0].out + ends[1].out + ends[2].out + ends[3].out, "abcd");
}

TEST_F(Pool, NoMoreChildrenRunAtATimeThanThereAreJobs) {
  limits_.jobs = 3;
  const auto ends = run(std::vector<Words>(20, {"say", "x"}));
  EXPECT_EQ(ends.size(), 20u);
  ASSERT_FALSE(states_.empty());
  std::size_t most = 0;
  for (const PoolState& state : states_) most = std::max(most, state.running);
  EXPECT_LE(most, 3u);
  EXPECT_EQ(states_.back().ended, 20u);
  EXPECT_EQ(states_.back().failed, 0u);
}

TEST_F(Pool, WithOneJobAChildStartsWhenTheOneBeforeHasEnded) {
  limits_.timeout = std::chrono::milliseconds(200);
  const auto ends = run({{"await", path("made")}, {"make", path("made")}});
  EXPECT_EQ(ends.at(0).kind, Kind::TimedOut);
  EXPECT_EQ(ends.at(1).kind, Kind::Exited);
}

TEST_F(Pool, AChildThatHangsIsEndedAndKeepsWhatItSaid) {
  limits_.timeout = std::chrono::milliseconds(300);
  const auto ends = run({{"say", "begun", "process", path("id"), "hang"}, {"say", "next"}});
  ASSERT_EQ(ends.size(), 2u);
  EXPECT_EQ(ends[0].kind, Kind::TimedOut);
  EXPECT_EQ(ends[0].out, "begun");
  EXPECT_GE(ends[0].seconds.count(), 0.3);
  EXPECT_EQ(ends[1].kind, Kind::Exited);
  EXPECT_EQ(ends[1].out, "next");
  // The pool waited for it, so no process has its number any more.
  const pid_t process = std::stoi(folder_.read("id"));
  EXPECT_EQ(::kill(process, 0), -1);
  EXPECT_EQ(errno, ESRCH);
}

TEST_F(Pool, AChildThatClosesItsStreamsAndHangsIsEndedToo) {
  limits_.timeout = std::chrono::milliseconds(200);
  EXPECT_EQ(run({{"close"}}).at(0).kind, Kind::TimedOut);
}

TEST_F(Pool, EverySignalThatEndsAChildIsReported) {
  limits_.jobs = 2;
  const std::vector<int> signals = {SIGABRT, SIGBUS,  SIGFPE,  SIGHUP,  SIGILL, SIGINT,
                                    SIGKILL, SIGPIPE, SIGSEGV, SIGTERM, SIGXCPU};
  std::vector<Words> children;
  for (const int signal : signals) children.push_back({"say", "begun", "signal", std::to_string(signal)});
  const auto ends = run(children);
  ASSERT_EQ(ends.size(), signals.size());
  for (std::size_t i = 0; i < signals.size(); ++i) {
    EXPECT_EQ(ends[i].kind, Kind::Signalled);
    EXPECT_EQ(ends[i].number, signals[i]);
    EXPECT_EQ(ends[i].out, "begun");
  }
  EXPECT_EQ(states_.back().failed, signals.size());
}

TEST_F(Pool, AChildThatWritesWithoutEndIsEndedAtTheLimitOfEitherStream) {
  limits_.jobs = 2;
  limits_.output = 100'000;
  const auto ends = run({{"say", "a", "flood", "out"}, {"flood", "err"}, {"fill", "100000", "x"}});
  ASSERT_EQ(ends.size(), 3u);
  EXPECT_EQ(ends[0].kind, Kind::TooMuchOutput);
  EXPECT_EQ(ends[0].out, 'a' + std::string(99'999, 'x'));
  EXPECT_EQ(ends[1].kind, Kind::TooMuchOutput);
  EXPECT_EQ(ends[1].err, std::string(100'000, 'x'));
  EXPECT_EQ(ends[2].kind, Kind::Exited);
  EXPECT_EQ(ends[2].out, std::string(100'000, 'x'));
}

TEST_F(Pool, OneByteBeyondTheLimitIsTooMuchThoughTheChildHasEnded) {
  limits_.output = 10;
  const auto ends = run({{"say", "0123456789a"}, {"say", "0123456789"}});
  EXPECT_EQ(ends.at(0).kind, Kind::TooMuchOutput);
  EXPECT_EQ(ends.at(0).out, "0123456789");
  EXPECT_EQ(ends.at(1).kind, Kind::Exited);
}

TEST_F(Pool, AChildGetsNoMoreMemoryThanItMayHave) {
  limits_.memory = std::uint64_t{64} << 20;
  const auto ends = run({{"eat"}, {"say", "next"}});
  EXPECT_EQ(ends.at(0).kind, Kind::Exited);
  EXPECT_EQ(ends.at(0).number, 5);
  EXPECT_EQ(ends.at(0).err, "no more memory\n");
  EXPECT_EQ(ends.at(1).out, "next");
}

TEST_F(Pool, AMemoryLimitInWhichNoProgramFitsIsTheEndOfThatChildAlone) {
  limits_.memory = 4096;
  const auto ends = run({{"say", "a"}, {"say", "b"}});
  ASSERT_EQ(ends.size(), 2u);
  for (const ChildEnd& end : ends) EXPECT_TRUE(end.kind == Kind::Signalled || end.kind == Kind::NotStarted);
}

TEST_F(Pool, AProgramThatIsNotThereIsNotStarted) {
  program_ = path("missing");
  const auto ends = run({{}, {}});
  ASSERT_EQ(ends.size(), 2u);
  for (const ChildEnd& end : ends) {
    EXPECT_EQ(end.kind, Kind::NotStarted);
    EXPECT_EQ(end.number, ENOENT);
  }
}

TEST_F(Pool, AProcessThatAChildLeavesBehindIsNotWaitedFor) {
  folder_.write("held", "");
  const auto ends = run({{"say", "a", "leave", path("held")}});
  std::filesystem::remove(path("held"));
  EXPECT_EQ(ends.at(0).kind, Kind::Exited);
  EXPECT_EQ(ends.at(0).out, "a");
}

// The first child waits for the fifth result, which comes only when children start though results wait.
TEST_F(Pool, ChildrenGoOnWhileAnEarlierOneIsLate) {
  limits_.jobs = 2;
  std::vector<Words> children = {{"await", path("last")}};
  for (int i = 0; i < 10; ++i) children.push_back({"say", "x"});
  children.push_back({"make", path("last")});
  const auto ends = run(children);
  EXPECT_EQ(ends.size(), 12u);
  for (const ChildEnd& end : ends) EXPECT_EQ(end.kind, Kind::Exited);
}

// Each result is 1,000 bytes; beyond 2,500 that wait, none is started: three have ended, and the first one,
// which the test sets free then, is late.
TEST_F(Pool, NoFurtherChildIsStartedWhileTooManyResultsWait) {
  limits_.jobs = 2;
  limits_.waiting = 2500;
  std::vector<Words> children = {{"await", path("free")}};
  for (int i = 0; i < 10; ++i) children.push_back({"fill", "1000", "x"});
  std::size_t most = 0;
  int looks = 0;
  watch_ = [&](const PoolState& state, std::size_t handedOut) {
    if (handedOut != 0 || looks == 5) return;
    most = std::max(most, state.ended);
    // Time enough for a fourth to start and end, if it were to.
    if (state.ended >= 3 && ++looks == 5) std::ofstream(path("free")).flush();
  };
  EXPECT_EQ(run(children).size(), 11u);
  EXPECT_GE(looks, 5);
  EXPECT_EQ(most, 3u);
}

TEST_F(Pool, NothingIsLeftOpen) {
  limits_.jobs = 4;
  limits_.timeout = std::chrono::milliseconds(200);
  const std::size_t before = openDescriptors();
  run({{"say", "a"}, {"hang"}, {"signal", "11"}, {"end", "1"}});
  EXPECT_EQ(openDescriptors(), before);
  program_ = path("missing");
  run({{}, {}});
  EXPECT_EQ(openDescriptors(), before);
}

TEST_F(Pool, AnExceptionOfAFunctionEndsTheChildren) {
  limits_.jobs = 2;
  watch_ = [&](const PoolState&, std::size_t) {
    if (std::filesystem::exists(path("id"))) throw std::runtime_error("enough");
  };
  EXPECT_THROW(run({{"process", path("id"), "hang"}, {"hang"}}), std::runtime_error);
  EXPECT_EQ(::waitpid(-1, nullptr, WNOHANG), -1);
  EXPECT_EQ(errno, ECHILD);
}

TEST_F(Pool, NothingRunsAnyMoreOnceNoMoreResultsAreWanted) {
  limits_.jobs = 3;
  wanted_ = 2;
  const auto ends = run({{"say", "a"}, {"say", "b"}, {"hang"}, {"hang"}, {"hang"}});
  EXPECT_EQ(ends.size(), 2u);
  EXPECT_EQ(::waitpid(-1, nullptr, WNOHANG), -1);
  EXPECT_EQ(errno, ECHILD);
}

TEST_F(Pool, EndsAreSeenThoughTheyWereIgnoredBefore) {
  const auto before = ::signal(SIGCHLD, SIG_IGN);
  const auto ends = run({{"end", "7"}, {"say", "x"}});
  ::signal(SIGCHLD, before);
  EXPECT_EQ(ends.at(0).number, 7);
  EXPECT_EQ(ends.at(1).out, "x");
}

// Sweeps the number of descriptors that the process may open, from none to enough.
TEST_F(Pool, WhateverCannotBeOpenedEveryChildHasAResult) {
  limits_.jobs = 3;
  const int signal = testsupport::SignalOfOwnProcess([&] {
    rlimit limit{};
    ::getrlimit(RLIMIT_NOFILE, &limit);
    std::map<Kind, std::size_t> kinds;
    for (rlim_t most = 3; most < kDescriptorsOfAProgram; ++most) {
      limit.rlim_cur = most;
      if (::setrlimit(RLIMIT_NOFILE, &limit) != 0) throw std::runtime_error("no limit");
      const auto ends = run(std::vector<Words>(5, {"say", "x"}));
      if (ends.size() != 5) throw std::runtime_error("a child has no result");
      for (const ChildEnd& end : ends) {
        ++kinds[end.kind];
        const bool good = end.kind == Kind::Exited && end.number == 0 && end.out == "x";
        const bool notStarted = end.kind == Kind::NotStarted && end.number == EMFILE;
        // The program itself needs a descriptor for each library that it loads.
        const bool notLoaded = end.kind == Kind::Exited && end.number == 127;
        if (!good && !notStarted && !notLoaded) throw std::runtime_error("another end");
      }
    }
    if (kinds[Kind::NotStarted] == 0 || kinds[Kind::Exited] == 0) throw std::runtime_error("no sweep");
  });
  EXPECT_EQ(signal, 0);
}

// A user who may have no further process.
TEST_F(Pool, AChildThatCannotBeForkedIsNotStarted) {
  const int signal = testsupport::SignalOfOwnProcess([&] {
    if (::geteuid() == 0 && ::setuid(kNobody) != 0) throw std::runtime_error("no other user");
    const rlimit none{0, 0};
    ::setrlimit(RLIMIT_NPROC, &none);
    const auto ends = run({{"say", "a"}, {"say", "b"}});
    if (ends.size() != 2) throw std::runtime_error("a child has no result");
    for (const ChildEnd& end : ends) {
      if (end.kind != Kind::NotStarted || end.number != EAGAIN) throw std::runtime_error("another end");
    }
  });
  EXPECT_EQ(signal, 0);
}

}  // namespace
}  // namespace mayascene_test
