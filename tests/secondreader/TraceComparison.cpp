#include "tests/secondreader/TraceComparison.h"

#include <algorithm>
#include <charconv>
#include <cmath>

namespace secondreader {
namespace {

constexpr double kTolerance = 1e-12;
constexpr double kTurn = 360.0;
constexpr std::string_view kValueKey = "\"value\":[";
constexpr std::string_view kNothing = "(nothing)";

// Where the doubles of a line begin; its end when it has none.
std::size_t doublesOf(std::string_view line) {
  // The last place: a name that holds such a text stands before it.
  const std::size_t place = line.rfind(kValueKey);
  return place == std::string_view::npos ? line.size() : place + kValueKey.size();
}

bool agree(double a, double b, Rounding rounding) {
  const double difference = std::fabs(a - b);
  const double larger = std::max(std::fabs(a), std::fabs(b));
  switch (rounding) {
    case Rounding::None:
      return a == b;
    case Rounding::Last:
      return difference <= kTolerance * larger;
    case Rounding::Angle:
      return difference <= kTolerance * std::max(larger, kTurn / 2.0);
    case Rounding::HalfTurn:
      return std::fabs(std::remainder(difference, kTurn)) <= kTolerance * std::max(larger, kTurn / 2.0);
  }
  return false;
}

// The number that the whole text is; nothing where it is none, as "inf" in its quotes.
std::optional<double> numberOf(std::string_view text) {
  double number = 0.0;
  const auto result = std::from_chars(text.data(), text.data() + text.size(), number);
  if (result.ec != std::errc{} || result.ptr != text.data() + text.size()) return std::nullopt;
  return number;
}

// Takes the text up to the first of the marks off the front.
std::string_view takeUpTo(std::string_view* rest, std::string_view marks) {
  const std::string_view taken = rest->substr(0, rest->find_first_of(marks));
  rest->remove_prefix(taken.size());
  return taken;
}

// Both begin with the numbers of an array; what stands after it is compared as it stands.
bool doublesAgree(std::string_view a, std::string_view b, Rounding rounding) {
  while (a != b) {
    const std::string_view textA = takeUpTo(&a, ",]");
    const std::string_view textB = takeUpTo(&b, ",]");
    const auto x = numberOf(textA);
    const auto y = numberOf(textB);
    if (x && y ? !agree(*x, *y, rounding) : textA != textB) return false;
    if (a.empty() || b.empty() || a.front() != b.front()) return false;
    if (a.front() == ']') return a == b;
    a.remove_prefix(1);
    b.remove_prefix(1);
  }
  return true;
}

}  // namespace

bool linesAgree(const PredictedLine& line, std::string_view traced) {
  const std::string_view predicted = line.text;
  if (predicted == traced) return true;
  if (line.rounding == Rounding::None) return false;
  const std::size_t first = doublesOf(predicted);
  if (first != doublesOf(traced) || predicted.substr(0, first) != traced.substr(0, first)) return false;
  return doublesAgree(predicted.substr(first), traced.substr(first), line.rounding);
}

std::optional<TraceDifference> firstDifference(const std::vector<PredictedLine>& predicted,
                                               const std::vector<std::string>& traced) {
  const std::size_t count = std::max(predicted.size(), traced.size());
  for (std::size_t i = 0; i < count; ++i) {
    const bool both = i < predicted.size() && i < traced.size();
    if (both && linesAgree(predicted[i], traced[i])) continue;
    return TraceDifference{i + 1, i < predicted.size() ? predicted[i].text : std::string(kNothing),
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
