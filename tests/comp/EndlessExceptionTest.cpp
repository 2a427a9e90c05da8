// From one call on every call throws: sooner or later one of them is a suite release, and that ends the
// process.
#include <gtest/gtest.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <cstdio>
#include <cstdlib>

#include "hostapi/ErrorCodes.h"
#include "tests/comp/FailureScenes.h"
#include "tests/comp/SweptImport.h"
#include "tests/support/BuilderRun.h"

namespace testsupport {
namespace {

using refhost::Failure;

// How a process of its own ends that makes the import: the signal, or 0 when it returned that code.
int EndOf(const std::filesystem::path& scene, const refhost::HostOptions& options, HostError code) {
  std::fflush(nullptr);
  const pid_t process = fork();
  if (process == 0) {
    const rlimit none{0, 0};
    setrlimit(RLIMIT_CORE, &none);
    if (std::freopen("/dev/null", "w", stderr) == nullptr) _exit(EXIT_FAILURE);
    _exit(ImportPath(scene, options).result.code == code ? EXIT_SUCCESS : EXIT_FAILURE);
  }
  int status = 0;
  EXPECT_EQ(waitpid(process, &status, 0), process);
  if (WIFSIGNALED(status)) return WTERMSIG(status);
  EXPECT_EQ(WEXITSTATUS(status), EXIT_SUCCESS);
  return 0;
}

// Walks the calls of the good run, and returns how many points those are.
int ExpectEnds(const std::filesystem::path& scene, refhost::HostOptions options, std::size_t share) {
  const std::vector<std::string> good = ImportPath(scene, options).trace;
  const std::size_t stride = SweepStride(good.size(), share);
  int points = 0;
  HeldByImport held;
  for (std::size_t index = 0; index < good.size(); ++index) {
    HeldByImport left = held;
    left.Take(good[index], true);
    // Only while no suite is held does nothing have to be released.
    const bool ends = !left.CleanUp().empty() || CallName(good[index]) == "ReleaseSuiteByName";
    held.Take(good[index], false);
    if (index % stride != 0) continue;
    for (const auto& [kind, code] : {std::pair(Failure::Kind::BadAlloc, HOST_ERR_EXCEPTION_MEMORY),
                                     std::pair(Failure::Kind::RuntimeError, HOST_ERR_EXCEPTION_OTHER)}) {
      ++points;
      options.failures = {{"", static_cast<std::int64_t>(index) + 1, true, kind, 0}};
      EXPECT_EQ(EndOf(scene, options, code), ends ? SIGABRT : 0)
          << "from call " << index + 1 << ": " << good[index];
    }
  }
  std::printf("%s: %d points walked\n", scene.stem().c_str(), points);
  return points;
}

class EndlessExceptionTest : public ::testing::TestWithParam<FailureScene> {};

TEST_P(EndlessExceptionTest, EndsTheProcessAtASuiteReleaseOrIsReported) {
  refhost::HostOptions options;
  options.zoomKeys = GetParam().zoomKeys;
  EXPECT_GT(ExpectEnds(TemporaryFile(GetParam().text).path(), options, kShareOfCalls), 0);
}

INSTANTIATE_TEST_SUITE_P(Scenes, EndlessExceptionTest, ::testing::ValuesIn(FailureScenes()),
                         [](const auto& scene) { return scene.param.name; });

class EndlessExceptionInExampleTest : public ::testing::TestWithParam<std::string> {};

TEST_P(EndlessExceptionInExampleTest, EndsTheProcessAtASuiteReleaseOrIsReported) {
  EXPECT_GT(ExpectEnds(ExampleScene(GetParam()), {}, kSmallShare), 0);
}

INSTANTIATE_TEST_SUITE_P(Examples, EndlessExceptionInExampleTest, ::testing::ValuesIn(ExampleNames()),
                         [](const auto& example) { return example.param; });

}  // namespace
}  // namespace testsupport
