#include "tests/check/StopContradictions.h"

#include <algorithm>
#include <optional>

namespace check_test {
namespace {

using check::Finding;
using check::Stop;
using diag::Code;

bool IsStop(Code code) { return code >= Code::ImportStopped && code <= Code::NumberUnreadable; }

struct Codes {
  Code first, last;
};

// The codes that say a stop.
Codes CodesOf(Stop stop) {
  switch (stop) {
    case Stop::NotAScene:
      return {Code::NotMayaAscii, Code::MarkBeforeHeader};
    case Stop::RefusedByte:
      return {Code::UnquotedPath, Code::RefusedByte};
    case Stop::UnexpectedEnd:
      return {Code::LastCommentOpen, Code::CutOffInCommand};
    case Stop::UnequalKeys:
      return {Code::UnequalKeys, Code::UnequalKeys};
    case Stop::LargeNumber:
      return {Code::NumberTooLarge, Code::NumberTooLarge};
    case Stop::BadNumber:
      return {Code::NumberUnreadable, Code::NumberUnreadable};
    default:
      return {Code::ImportStopped, Code::ImportStopped};
  }
}

std::string Named(const Finding& finding) {
  return diag::NameOf(finding.diagnostic.code) + " at line " + std::to_string(finding.diagnostic.place.line);
}

// A stop that nothing in the scene explains is said by its code.
bool SaysTheCode(const Finding& finding, const check::CameOver& cameOver) {
  return finding.diagnostic.code == Code::ImportStopped &&
         finding.diagnostic.arguments[0] == std::to_string(cameOver.code);
}

}  // namespace

std::string StopContradictionIn(const check::CameOver& cameOver, const check::Report& report,
                                bool wellFormed) {
  const auto stop = std::find_if(report.findings.begin(), report.findings.end(),
                                 [](const Finding& finding) { return IsStop(finding.diagnostic.code); });
  if (cameOver.stop == Stop::None) return stop == report.findings.end() ? "" : "no stop, but " + Named(*stop);
  if (stop == report.findings.end()) return "the import stopped, and the report does not say so";
  const Codes codes = CodesOf(cameOver.stop);
  const Code code = stop->diagnostic.code;
  if (!wellFormed && SaysTheCode(*stop, cameOver)) return "";
  if (code < codes.first || code > codes.last)
    return "code " + std::to_string(cameOver.code) + " at line " + std::to_string(cameOver.line) + ", but " +
           Named(*stop);
  const bool inText = code >= Code::UnquotedPath && code != Code::UnequalKeys;
  if (!inText || cameOver.line == 0) return "";
  const std::uint64_t line = stop->diagnostic.place.line;
  // A command that is cut off is shown where it begins.
  const bool same = code == Code::CutOffInCommand ? line <= cameOver.line : line == cameOver.line;
  return same ? "" : "stopped at line " + std::to_string(cameOver.line) + ", but " + Named(*stop);
}

}  // namespace check_test
