#include "tools/mayascene/CheckResult.h"

#include <fmt/format.h>

#include <charconv>
#include <chrono>
#include <cstring>
#include <sstream>
#include <system_error>
#include <utility>

#include "tools/mayascene/CheckJson.h"
#include "tools/mayascene/CheckText.h"
#include "tools/mayascene/TerminalText.h"

namespace mayascene {
namespace {

constexpr std::string_view kForm = "mayascene-check-result";
constexpr std::size_t kMiB = std::size_t{1} << 20;

// Takes " 123" off the line.
bool takeNumber(std::string_view* line, std::size_t* number) {
  if (!line->starts_with(' ')) return false;
  line->remove_prefix(1);
  const std::from_chars_result end = std::from_chars(line->data(), line->data() + line->size(), *number);
  if (end.ec != std::errc()) return false;
  line->remove_prefix(static_cast<std::size_t>(end.ptr - line->data()));
  return true;
}

std::string sizeText(std::size_t bytes) {
  return bytes % kMiB == 0 ? fmt::format("{} MiB", bytes / kMiB) : fmt::format("{} bytes", bytes);
}

std::string secondsText(std::chrono::duration<double> duration) {
  return fmt::format("{:g} s", duration.count());
}

std::string breakText(const ChildEnd& end) {
  if (end.kind != ChildEnd::Kind::Signalled) {
    return fmt::format("its process ended with status {} and without a whole report", end.number);
  }
  const char* const name = ::strsignal(end.number);
  const std::string named = name == nullptr ? "" : fmt::format(" ({})", name);
  return fmt::format("its process was ended by signal {}{}", end.number, named);
}

diag::Diagnostic diagnosticOf(const ChildEnd& end, const PoolLimits& limits) {
  switch (end.kind) {
    case ChildEnd::Kind::TimedOut:
      return {.code = diag::Code::CheckTimedOut, .arguments = {secondsText(limits.timeout)}};
    case ChildEnd::Kind::TooMuchOutput:
      return {.code = diag::Code::ReportTooLarge, .arguments = {sizeText(limits.output)}};
    case ChildEnd::Kind::NotStarted:
      return {.code = diag::Code::CheckNotStarted, .arguments = {std::strerror(end.number)}};
    default:
      break;
  }
  // A child writes only to its parent, so here the status means that the memory is exhausted.
  const bool noMemory =
      end.kind == ChildEnd::Kind::Exited && end.number == static_cast<int>(ExitStatus::CannotWrite);
  if (noMemory) return {.code = diag::Code::CheckOutOfMemory};
  return {.code = diag::Code::CheckBrokeOff, .arguments = {breakText(end)}};
}

}  // namespace

CheckResult resultOf(const CheckedScene& scene, const CheckArguments& arguments) {
  CheckResult result;
  result.status = scene.status;
  if (scene.failure.empty()) {
    std::ostringstream report;
    printCheck(report, scene, {arguments.quiet, arguments.options.all}, Style(arguments.colourReport));
    result.report = std::move(report).str();
    result.totals = totalsText(scene.report);
  }
  if (!arguments.json.empty()) {
    std::ostringstream object;
    text::JsonWriter json(object);
    writeCheckedScene(json, scene);
    result.json = std::move(object).str();
  }
  return result;
}

void handOver(std::ostream& out, const CheckResult& result) {
  out << kForm << ' ' << static_cast<int>(result.status) << ' ' << result.totals.size() << ' '
      << result.report.size() << ' ' << result.json.size() << '\n'
      << result.totals << result.report << result.json << std::flush;
}

bool handedOver(std::string_view bytes, CheckResult* result) {
  const std::size_t end = bytes.find('\n');
  if (end == std::string_view::npos || !bytes.starts_with(kForm)) return false;
  std::string_view line = bytes.substr(kForm.size(), end - kForm.size());
  bytes.remove_prefix(end + 1);
  std::size_t status = 0;
  if (!takeNumber(&line, &status) || status > static_cast<std::size_t>(ExitStatus::CannotWrite)) {
    return false;
  }
  result->status = static_cast<ExitStatus>(status);
  for (std::string* text : {&result->totals, &result->report, &result->json}) {
    std::size_t size = 0;
    if (!takeNumber(&line, &size) || size > bytes.size()) return false;
    *text = bytes.substr(0, size);
    bytes.remove_prefix(size);
  }
  return line.empty() && bytes.empty();
}

CheckedScene unfinishedCheck(const std::string& path, const ChildEnd& end, const PoolLimits& limits) {
  CheckedScene scene;
  scene.path = path;
  scene.status = end.kind == ChildEnd::Kind::NotStarted ? ExitStatus::CannotWrite : ExitStatus::Refused;
  scene.report.findings.push_back({.diagnostic = diagnosticOf(end, limits), .end = {}, .excerpt = ""});
  scene.report.errors = 1;
  scene.unfinished = true;
  return scene;
}

}  // namespace mayascene
