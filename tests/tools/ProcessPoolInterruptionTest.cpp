// What is left of the children when the process that runs them is ended.
#include <gtest/gtest.h>
#include <signal.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <chrono>
#include <cstdlib>
#include <fstream>
#include <iterator>
#include <string>
#include <thread>
#include <vector>

#include "tests/support/TemporaryFolder.h"
#include "tools/mayascene/Interruption.h"
#include "tools/mayascene/ProcessPool.h"

namespace mayascene_test {
namespace {

using namespace std::chrono_literals;
using Words = std::vector<std::string>;

constexpr int kTries = 20'000;
constexpr std::size_t kChildren = 3;

bool gone(pid_t process) { return ::kill(process, 0) != 0 && errno == ESRCH; }

class PoolInterruption : public ::testing::Test {
 protected:
  std::string idFile(std::size_t number) const { return (folder_.path() / std::to_string(number)).string(); }

  // A process that runs children, all of which hang, and whose unfinished file is "output".
  pid_t startRunner() {
    folder_.write("output", "half");
    const pid_t runner = ::fork();
    if (runner != 0) return runner;
    const std::string output = (folder_.path() / "output").string();
    mayascene::handleInterruptions();
    mayascene::rememberUnfinished(output.c_str());
    mayascene::PoolLimits limits;
    limits.jobs = kChildren;
    mayascene::ProcessPool(limits).run(
        kChildren,
        [this](std::size_t number) {
          return Words{MISBEHAVING_CHILD, "process", idFile(number), "hang"};
        },
        [](std::size_t, mayascene::ChildEnd) { return true; }, [](const mayascene::PoolState&) {});
    ::_exit(EXIT_SUCCESS);
  }

  // The ids of the children, once all of them are at work.
  std::vector<pid_t> children() const {
    std::vector<pid_t> processes;
    for (std::size_t i = 0; i < kChildren; ++i) {
      for (int tries = 0; folder_.read(std::to_string(i)).empty() && tries < kTries; ++tries) {
        std::this_thread::sleep_for(1ms);
      }
      processes.push_back(std::stoi(folder_.read(std::to_string(i))));
    }
    return processes;
  }

  testsupport::TemporaryFolder folder_;
};

TEST_F(PoolInterruption, ASignalEndsTheChildrenAndLeavesNothingBehind) {
  for (const int signal : {SIGINT, SIGTERM, SIGHUP}) {
    for (std::size_t i = 0; i < kChildren; ++i) ::unlink(idFile(i).c_str());
    const pid_t runner = startRunner();
    ASSERT_GT(runner, 0);
    const std::vector<pid_t> processes = children();
    ::kill(runner, signal);
    int status = 0;
    ASSERT_EQ(::waitpid(runner, &status, 0), runner);
    EXPECT_TRUE(WIFEXITED(status));
    EXPECT_EQ(WEXITSTATUS(status), 128 + signal);
    // The runner has waited for them: they are gone before it is.
    for (const pid_t process : processes) EXPECT_TRUE(gone(process)) << signal;
    EXPECT_NE(::access((folder_.path() / "output").c_str(), F_OK), 0);
  }
}

// Nobody can wait for them then; they end by themselves, and soon.
TEST_F(PoolInterruption, ChildrenEndWithARunnerThatIsKilled) {
  const pid_t runner = startRunner();
  ASSERT_GT(runner, 0);
  const std::vector<pid_t> processes = children();
  ::kill(runner, SIGKILL);
  ASSERT_EQ(::waitpid(runner, nullptr, 0), runner);
  for (const pid_t process : processes) {
    // An orphan without a waiting parent may keep its process id. It must not run any more.
    const std::string file = "/proc/" + std::to_string(process) + "/stat";
    const auto over = [&] {
      std::ifstream in(file);
      std::string text((std::istreambuf_iterator<char>(in)), std::istreambuf_iterator<char>());
      return text.empty() || text.find(") Z") != std::string::npos;
    };
    for (int tries = 0; !over() && tries < kTries; ++tries) std::this_thread::sleep_for(1ms);
    EXPECT_TRUE(over());
  }
}

// Children come and go while the signals come: none is missed between its start and its being known.
TEST_F(PoolInterruption, ASignalAtAnyMomentLeavesNoChild) {
  for (int microseconds = 0; microseconds < 20'000; microseconds += 997) {
    const pid_t runner = ::fork();
    ASSERT_GE(runner, 0);
    if (runner == 0) {
      ::setpgid(0, 0);
      mayascene::handleInterruptions();
      mayascene::PoolLimits limits;
      limits.jobs = 2;
      mayascene::ProcessPool(limits).run(
          100'000,
          [](std::size_t number) {
            return Words{MISBEHAVING_CHILD, "say", std::to_string(number)};
          },
          [](std::size_t, mayascene::ChildEnd) { return true; }, [](const mayascene::PoolState&) {});
      ::_exit(EXIT_SUCCESS);
    }
    ::setpgid(runner, runner);
    std::this_thread::sleep_for(std::chrono::microseconds(20'000 + microseconds));
    ::kill(runner, SIGTERM);
    int status = 0;
    ASSERT_EQ(::waitpid(runner, &status, 0), runner);
    EXPECT_EQ(WEXITSTATUS(status), 128 + SIGTERM);
    // The children are in its process group, which is empty now.
    EXPECT_TRUE(gone(-runner));
  }
}

}  // namespace
}  // namespace mayascene_test
