#include "tools/mayascene/Progress.h"

#include <fmt/format.h>

#include <sys/ioctl.h>
#include <unistd.h>

#include <algorithm>
#include <cstdint>
#include <cstdlib>
#include <string_view>
#include <utility>

namespace mayascene {
namespace {

constexpr std::size_t kUsualWidth = 80;
constexpr std::size_t kBar = 24;
constexpr double kMostSeconds = 1e9;  // of a duration that is shown
constexpr std::int64_t kMinute = 60;
constexpr std::int64_t kHour = 60 * kMinute;
constexpr std::string_view kToLineStart = "\r";
constexpr std::string_view kRemoveLine = "\r\x1b[K";

std::string barText(const ProgressState& state) {
  const std::size_t filled = state.all == 0 ? kBar : kBar * state.done / state.all;
  std::string bar(kBar, ' ');
  bar.replace(0, filled, filled, '=');
  if (filled < kBar) bar[filled] = '>';
  return fmt::format("[{}]  ", bar);
}

std::string rateText(double rate) {
  return rate < 10.0 ? fmt::format("{:.1f}/s", rate) : fmt::format("{:.0f}/s", rate);
}

std::string timeText(const ProgressState& state) {
  if (state.done == 0 || state.seconds.count() <= 0.0) return "";
  const double rate = static_cast<double>(state.done) / state.seconds.count();
  const auto left = static_cast<double>(state.all - state.done);
  return fmt::format(", {}, {} left", rateText(rate),
                     durationText(std::chrono::duration<double>(left / rate)));
}

}  // namespace

std::string durationText(std::chrono::duration<double> duration) {
  const double clamped = duration.count() < kMostSeconds ? duration.count() : kMostSeconds;
  const auto seconds = static_cast<std::int64_t>(clamped + 0.5);
  if (seconds < kMinute) return fmt::format("{} s", seconds);
  if (seconds < kHour) return fmt::format("{} min {} s", seconds / kMinute, seconds % kMinute);
  return fmt::format("{} h {} min", seconds / kHour, seconds % kHour / kMinute);
}

std::string progressText(const ProgressState& state, std::size_t width) {
  std::string text =
      fmt::format("{} of {} done, {} failed{}", state.done, state.all, state.failed, timeText(state));
  const std::string bar = barText(state);
  if (bar.size() + text.size() <= width) return bar + text;
  text.resize(std::min(text.size(), width));
  return text;
}

void Progress::draw(const ProgressState& state) {
  std::string text = progressText(state, width_);
  if (text == drawn_) return;
  terminal_ << (drawn_.size() > text.size() ? kRemoveLine : kToLineStart) << text << std::flush;
  drawn_ = std::move(text);
}

void Progress::clear() {
  if (!drawn_.empty()) terminal_ << kRemoveLine << std::flush;
  drawn_.clear();
}

std::size_t terminalWidth(int descriptor) {
  if (::isatty(descriptor) == 0) return 0;
  const char* const kind = std::getenv("TERM");
  if (kind == nullptr || std::string_view(kind) == "dumb") return 0;
  winsize size{};
  if (::ioctl(descriptor, TIOCGWINSZ, &size) != 0 || size.ws_col == 0) return kUsualWidth;
  // Text in the last column makes some terminals go to the next line.
  return size.ws_col - 1u;
}

}  // namespace mayascene
