#include "tests/check/Contradictions.h"

#include <algorithm>
#include <initializer_list>
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

// Lines as the import counts them: a carriage return alone ends one too.
std::uint64_t LineAt(std::string_view text, std::uint64_t offset) {
  std::uint64_t line = 1;
  for (std::size_t i = 0; i < offset && i < text.size(); ++i) {
    if (text[i] == '\n' || (text[i] == '\r' && (i + 1 == text.size() || text[i + 1] != '\n'))) ++line;
  }
  return line;
}

std::string Named(const Finding& finding) {
  return diag::NameOf(finding.diagnostic.code) + " at line " + std::to_string(finding.diagnostic.place.line);
}

// A stop that nothing in the scene explains is said by its code.
bool SaysTheCode(const Finding& finding, const check::CameOver& cameOver) {
  return finding.diagnostic.code == Code::ImportStopped &&
         finding.diagnostic.arguments[0] == std::to_string(cameOver.code);
}

std::string StopContradiction(std::string_view text, const check::CameOver& cameOver,
                              const check::Report& report, bool wellFormed) {
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
  const std::uint64_t line = LineAt(text, stop->diagnostic.range.offset);
  // A command that is cut off is shown where it begins.
  const bool same = code == Code::CutOffInCommand ? line <= cameOver.line : line == cameOver.line;
  return same ? "" : "stopped at line " + std::to_string(cameOver.line) + ", but " + Named(*stop);
}

bool HasOneOf(const check::Report& report, std::initializer_list<Code> codes) {
  return std::any_of(report.findings.begin(), report.findings.end(), [&](const Finding& finding) {
    return std::find(codes.begin(), codes.end(), finding.diagnostic.code) != codes.end();
  });
}

// The keys that the importer takes of a transform with these drivers: what its curves of several keys have.
std::size_t KeysOf(const check::ChainLink& link) {
  std::size_t keys = 0;
  for (const check::Drive& drive : link.drives) {
    if (drive.keys.value_or(0) > 1) keys = *drive.keys;
  }
  return keys;
}

std::string CameraContradiction(const check::CameraHead& camera, const check::Report& report) {
  if (!camera.cameOver) return "";
  const std::size_t keys = camera.chain.empty() ? 0 : KeysOf(camera.chain.front());
  const bool lost =
      HasOneOf(report, {Code::ConnectionToPath, Code::ParentIsPath, Code::ParentNotImported,
                        Code::ParentElsewhere, Code::SameNames, Code::NamesDifferInCase, Code::NameTooLong,
                        Code::NodeWithoutName, Code::AlreadyConnected, Code::NameTaken});
  if (camera.keys != keys && !lost) {
    return camera.path + " has " + std::to_string(keys) + " keys, " + std::to_string(camera.keys) +
           " came over";
  }
  for (const check::Drive& drive :
       camera.chain.empty() ? std::vector<check::Drive>() : camera.chain.front().drives) {
    const bool explained =
        HasOneOf(report, {Code::DrivenByNoCurve, Code::CurveThroughNode, Code::LookAtShortNames,
                          Code::LookAtNotTaken, Code::LookAtWeightLast}) ||
        drive.type == "aimConstraint" || drive.type == "lookAt";
    if (!drive.keys && !explained) return camera.path + ": nothing is said of the driver of " + drive.channel;
  }
  for (const check::Drive& drive : camera.drives) {
    if (drive.channel != "focalLength") continue;
    if (drive.keys && *drive.keys != camera.zoomKeys && !lost)
      return camera.path + ": the keys of its zoom differ";
    if (!drive.keys && !HasOneOf(report, {Code::FocalLengthElsewhere}))
      return camera.path + ": nothing is said of its zoom";
  }
  return "";
}

std::string LayerContradiction(const check::CameOver& cameOver, const check::Report& report) {
  std::size_t came = 0;
  for (const check::CameraHead& camera : report.head.cameras) came += camera.cameOver ? 1 : 0;
  const auto layers = static_cast<std::size_t>(std::count_if(
      cameOver.layers.begin(), cameOver.layers.end(),
      [](const check::CameOverLayer& layer) { return layer.kind == check::LayerKind::Camera; }));
  if (came != layers)
    return std::to_string(layers) + " cameras came over, the report has " + std::to_string(came);
  for (const check::CameraHead& camera : report.head.cameras) {
    const std::string wrong = CameraContradiction(camera, report);
    if (!wrong.empty()) return wrong;
  }
  return "";
}

}  // namespace

std::string ContradictionIn(std::string_view text, const check::CameOver& cameOver,
                            const check::Report& report, bool wellFormed) {
  const std::string wrong = StopContradiction(text, cameOver, report, wellFormed);
  if (!wrong.empty() || !wellFormed || cameOver.stop != Stop::None || report.head.camerasNotShown != 0)
    return wrong;
  return LayerContradiction(cameOver, report);
}

}  // namespace check_test
