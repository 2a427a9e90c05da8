#include "tests/secondreader/TraceComparison.h"

#include <algorithm>
#include <charconv>
#include <cmath>

namespace secondreader {
namespace {

constexpr double kTolerance = 1e-9;
constexpr std::string_view kDoubleKeys[] = {"\"value\":[", "\"center\":[", "\"filmSize\":"};
constexpr std::string_view kNothing = "(nothing)";

// Where the doubles of a line begin; its end when it has none.
std::size_t doublesOf(std::string_view line) {
  std::size_t first = line.size();
  for (const std::string_view key : kDoubleKeys) {
    // The last place: a name that holds such a text stands before it.
    const std::size_t place = line.rfind(key);
    if (place != std::string_view::npos) first = std::min(first, place + key.size());
  }
  return first;
}

bool nearlyEqual(double a, double b) {
  return a == b || std::fabs(a - b) <= kTolerance * std::max(std::fabs(a), std::fabs(b));
}

// Takes a number off the front; false when there is none.
bool takeNumber(std::string_view* rest, double* number) {
  const auto result = std::from_chars(rest->data(), rest->data() + rest->size(), *number);
  if (result.ec != std::errc{}) return false;
  rest->remove_prefix(static_cast<std::size_t>(result.ptr - rest->data()));
  return true;
}

bool doublesAgree(std::string_view a, std::string_view b) {
  while (!a.empty() && !b.empty()) {
    double x = 0.0;
    double y = 0.0;
    const bool isNumber = takeNumber(&a, &x);
    if (isNumber != takeNumber(&b, &y) || !nearlyEqual(x, y)) return false;
    if (isNumber) continue;
    if (a.front() != b.front()) return false;
    // A key behind the doubles is compared as it stands.
    if (a.front() == '"') return a == b;
    a.remove_prefix(1);
    b.remove_prefix(1);
    if (!a.empty() && a.front() == '"') return a == b;
  }
  return a.empty() && b.empty();
}

}  // namespace

bool linesAgree(std::string_view predicted, std::string_view traced) {
  if (predicted == traced) return true;
  const std::size_t first = doublesOf(predicted);
  if (first != doublesOf(traced) || predicted.substr(0, first) != traced.substr(0, first)) return false;
  return doublesAgree(predicted.substr(first), traced.substr(first));
}

std::optional<TraceDifference> firstDifference(const std::vector<std::string>& predicted,
                                               const std::vector<std::string>& traced) {
  const std::size_t count = std::max(predicted.size(), traced.size());
  for (std::size_t i = 0; i < count; ++i) {
    const bool both = i < predicted.size() && i < traced.size();
    if (both && linesAgree(predicted[i], traced[i])) continue;
    return TraceDifference{i + 1, i < predicted.size() ? predicted[i] : std::string(kNothing),
                           i < traced.size() ? traced[i] : std::string(kNothing)};
  }
  return std::nullopt;
}

std::vector<std::string> linesOf(std::string_view text) {
  std::vector<std::string> lines;
  while (!text.empty()) {
    const std::size_t end = std::min(text.find('\n'), text.size());
    lines.emplace_back(text.substr(0, end));
    text.remove_prefix(std::min(end + 1, text.size()));
  }
  return lines;
}

}  // namespace secondreader
