#include "tools/mayascene/CheckText.h"

#include <fmt/format.h>

#include <string>
#include <string_view>

#include "diag/ShownText.h"
#include "tools/mayascene/CheckHeadText.h"

namespace mayascene {
namespace {

std::string coloured(std::string_view line, diag::Severity severity, const Style& style) {
  return severity == diag::Severity::Error ? style.alarm(line) : style.strong(line);
}

void printFinding(std::ostream& out, const std::string& path, const check::Finding& finding,
                  const Style& style) {
  const diag::Diagnostic& diagnostic = finding.diagnostic;
  out << coloured(diag::HeadLineOf(path, diagnostic), diag::EntryOf(diagnostic.code).severity, style) << '\n';
  out << finding.excerpt << style.faint(diag::HelpLineOf(diagnostic)) << "\n\n";
}

// How many of a code there are beyond those that are shown.
void printNotInFull(std::ostream& out, const CheckedScene& scene, bool quiet) {
  for (const auto& [code, times] : scene.report.notInFull) {
    if (quiet && diag::EntryOf(code).severity != diag::Severity::Error) continue;
    out << diag::ShownText(scene.path) << ": " << times << " more of " << diag::NameOf(code)
        << " (--all shows them)\n\n";
  }
}

std::string countOf(std::uint64_t count, const std::string& thing) {
  if (count == 0) return fmt::format("no {}s", thing);
  return fmt::format("{} {}{}", count, thing, count == 1 ? "" : "s");
}

}  // namespace

std::string totalsText(const check::Report& report) {
  return fmt::format("{}, {}, {}", countOf(report.errors, "error"), countOf(report.warnings, "warning"),
                     countOf(report.notes, "note"));
}

void printCheck(std::ostream& out, const CheckedScene& scene, const ReportShape& shape, const Style& style) {
  if (!scene.failure.empty()) return;
  const check::Report& report = scene.report;
  if (!shape.quiet && !scene.unfinished) printHead(out, scene, shape.all, style);
  for (const check::Finding& finding : report.findings) {
    const bool error = diag::EntryOf(finding.diagnostic.code).severity == diag::Severity::Error;
    if (error || !shape.quiet) printFinding(out, scene.path, finding, style);
  }
  printNotInFull(out, scene, shape.quiet);
  if (!shape.quiet)
    out << style.strong(fmt::format("{}: {}", diag::ShownText(scene.path), totalsText(report))) << '\n';
}

}  // namespace mayascene
