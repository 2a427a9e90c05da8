// From one call on every call throws: sooner or later one of them is a suite release, and that ends the
// process.
#include <gtest/gtest.h>

#include <algorithm>
#include <csignal>
#include <cstdio>

#include "tests/comp/FailureScenes.h"
#include "tests/comp/SweptImport.h"
#include "tests/support/BuilderRun.h"
#include "tests/support/EndedCallback.h"

namespace testsupport {
namespace {

// The calls that a failed one leads to, as far as the first suite release; `left` is what it left to do.
std::vector<std::string> LastCalls(const std::string& failed, const HeldByCallback& left, const Way& way) {
  std::vector<std::string> calls = {failed};
  for (const std::string& call : way.kind == kOther.kind ? left.Unwinding() : left.CleanUp()) {
    if (CallName(calls.back()) == "ReleaseSuiteByName") break;
    calls.push_back(call);
  }
  return calls;
}

// The calls before the failure are those of the good run; then come the last ones, and each of them threw.
void ExpectCalls(const EndedCallback& ended, const std::vector<std::string>& good, std::size_t index,
                 const std::vector<std::string>& last, const Way& exception) {
  ASSERT_EQ(ended.trace.size(), index + last.size());
  EXPECT_TRUE(
      std::equal(good.begin(), good.begin() + static_cast<std::ptrdiff_t>(index), ended.trace.begin()));
  for (std::size_t i = 0; i < last.size(); ++i) {
    const std::string& line = ended.trace[index + i];
    EXPECT_EQ(Field(line, "error"), exception.error) << line;
    EXPECT_EQ(CallName(line), CallName(last[i]));
    if (i != 0) {  // what the first would have handed out is null
      EXPECT_EQ(WithoutError(line), last[i]);
    }
  }
}

// Walks the calls of the good run, and returns how many points those are.
int ExpectEnds(const std::filesystem::path& scene, refhost::HostOptions options, std::size_t share) {
  const std::vector<std::string> good = ImportPath(scene, options).trace;
  const std::vector<bool> walked = WalkedCalls(good, share);
  int points = 0;
  HeldByCallback held;
  for (std::size_t index = 0; index < good.size(); ++index) {
    if (walked[index]) {
      SCOPED_TRACE("from call " + std::to_string(index + 1) + ": " + good[index]);
      HeldByCallback left = held;
      left.Take(good[index], true);
      for (const Way& exception : kAllExceptions) {
        ++points;
        const std::vector<std::string> last = LastCalls(good[index], left, exception);
        // Only while no suite is held does nothing have to be released.
        const bool ends = CallName(last.back()) == "ReleaseSuiteByName";
        options.failures = {{"", static_cast<std::int64_t>(index) + 1, true, exception.kind, 0}};
        const EndedCallback ended = CallInAProcess(refhost::Callback::Import, scene, options);
        EXPECT_EQ(ended.signal, ends ? SIGABRT : 0);
        EXPECT_EQ(ended.code, ends ? 0 : exception.code);
        ExpectCalls(ended, good, index, last, exception);
      }
    }
    held.Take(good[index], false);
  }
  std::printf("%s: %d points walked\n", scene.stem().c_str(), points);
  return points;
}

class EndlessExceptionTest : public ::testing::TestWithParam<FailureScene> {};

TEST_P(EndlessExceptionTest, EndsTheProcessAtTheFirstSuiteReleaseOrIsReported) {
  refhost::HostOptions options;
  options.zoomKeys = GetParam().zoomKeys;
  EXPECT_GT(ExpectEnds(TemporaryFile(GetParam().text).path(), options, kShareOfCalls), 0);
}

INSTANTIATE_TEST_SUITE_P(Scenes, EndlessExceptionTest, ::testing::ValuesIn(FailureScenes()),
                         [](const auto& scene) { return scene.param.name; });

class EndlessExceptionInExampleTest : public ::testing::TestWithParam<std::string> {};

TEST_P(EndlessExceptionInExampleTest, EndsTheProcessAtTheFirstSuiteReleaseOrIsReported) {
  EXPECT_GT(ExpectEnds(ExampleScene(GetParam()), {}, kSmallShare), 0);
}

INSTANTIATE_TEST_SUITE_P(Examples, EndlessExceptionInExampleTest, ::testing::ValuesIn(ExampleNames()),
                         [](const auto& example) { return example.param; });

}  // namespace
}  // namespace testsupport
