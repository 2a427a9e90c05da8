// The progress of a long run on a terminal.
#include "tools/mayascene/Progress.h"

#include <gtest/gtest.h>

#include <sstream>
#include <string>

namespace mayascene_test {
namespace {

using mayascene::durationText;
using mayascene::Progress;
using mayascene::ProgressState;
using mayascene::progressText;
using Seconds = std::chrono::duration<double>;

constexpr std::size_t kWide = 200;

ProgressState state(std::size_t all, std::size_t done, std::size_t failed, double seconds) {
  return {all, done, failed, Seconds(seconds)};
}

TEST(ProgressText, ShowsWhatIsDoneAndFailedTheRateAndTheTimeLeft) {
  EXPECT_EQ(progressText(state(1000, 250, 14, 5.0), kWide),
            "[======>                 ]  250 of 1000 done, 14 failed, 50/s, 15 s left");
}

TEST(ProgressText, TheTimeLeftIsUnknownUntilSomethingIsDone) {
  EXPECT_EQ(progressText(state(7, 0, 0, 5.0), kWide), "[>                       ]  0 of 7 done, 0 failed");
  EXPECT_EQ(progressText(state(7, 1, 0, 0.0), kWide), "[===>                    ]  1 of 7 done, 0 failed");
}

TEST(ProgressText, TheBarIsFullAtTheEnd) {
  EXPECT_EQ(progressText(state(8, 8, 3, 16.0), kWide),
            "[========================]  8 of 8 done, 3 failed, 0.5/s, 0 s left");
  EXPECT_EQ(progressText(state(0, 0, 0, 1.0), kWide), "[========================]  0 of 0 done, 0 failed");
}

TEST(ProgressText, NeverIsWiderThanTheTerminal) {
  const ProgressState half = state(1000, 500, 3, 10.0);
  const std::string whole = progressText(half, kWide);
  for (std::size_t width = 0; width < whole.size(); ++width) {
    const std::string text = progressText(half, width);
    EXPECT_LE(text.size(), width);
    EXPECT_EQ(text.find('['), std::string::npos) << "half a bar says nothing";
  }
  EXPECT_EQ(progressText(half, whole.size()), whole);
  EXPECT_EQ(progressText(half, 21), "500 of 1000 done, 3 f");
}

TEST(DurationText, GrowsFromSecondsToHours) {
  EXPECT_EQ(durationText(Seconds(0.4)), "0 s");
  EXPECT_EQ(durationText(Seconds(59.4)), "59 s");
  EXPECT_EQ(durationText(Seconds(59.5)), "1 min 0 s");
  EXPECT_EQ(durationText(Seconds(125.0)), "2 min 5 s");
  EXPECT_EQ(durationText(Seconds(3600.0 * 3 + 60.0 * 20 + 59.0)), "3 h 20 min");
  EXPECT_EQ(durationText(Seconds(1e300)), "277777 h 46 min");
}

TEST(ProgressLine, IsDrawnOverItselfAndTakenAway) {
  std::ostringstream terminal;
  {
    Progress progress(terminal, 30);
    progress.draw(state(10, 1, 0, 0.0));
    progress.draw(state(10, 1, 0, 0.0));
    EXPECT_EQ(terminal.str(), "\r1 of 10 done, 0 failed");
    progress.clear();
    progress.clear();
    EXPECT_EQ(terminal.str(), "\r1 of 10 done, 0 failed\r\x1b[K");
    progress.draw(state(10, 1, 0, 0.0));
  }
  EXPECT_EQ(terminal.str(), "\r1 of 10 done, 0 failed\r\x1b[K\r1 of 10 done, 0 failed\r\x1b[K");
}

TEST(ProgressLine, AShorterLineLeavesNothingOfALongerOne) {
  std::ostringstream terminal;
  Progress progress(terminal, 60);
  progress.draw(state(100, 1, 0, 1000.0));
  terminal.str("");
  progress.draw(state(100, 100, 0, 1.0));
  EXPECT_EQ(terminal.str(), "\r\x1b[K100 of 100 done, 0 failed, 100/s, 0 s left");
}

}  // namespace
}  // namespace mayascene_test
