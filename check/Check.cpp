#include "check/Check.h"

#include <algorithm>
#include <limits>
#include <map>
#include <set>
#include <utility>

#include "check/HeadInternal.h"
#include "check/RulesInternal.h"
#include "diag/Excerpt.h"
#include "scene/Scene.h"

namespace check {
namespace {

diag::Severity SeverityOf(const Finding& finding) { return diag::EntryOf(finding.diagnostic.code).severity; }

bool IsWanted(diag::Code code, const Options& options) {
  return options.only.empty() ||
         std::find(options.only.begin(), options.only.end(), code) != options.only.end();
}

std::uint64_t* CountOf(diag::Severity severity, Report* report) {
  if (severity == diag::Severity::Error) return &report->errors;
  return severity == diag::Severity::Warning ? &report->warnings : &report->notes;
}

// The line at which the import stops reading; 0 where it does not.
std::uint32_t StopLine(const diag::Collector& collector) {
  for (const diag::Diagnostic& one : collector.kept()) {
    const bool stops = one.code >= diag::Code::UnquotedPath && one.code <= diag::Code::CutOffInCommand;
    if (stops) return one.place.line;
  }
  return 0;
}

// Whether the reader of the whole scene passed over what the import stops at.
bool IsTheStopAgain(const diag::Diagnostic& diagnostic, std::uint32_t stopLine) {
  return diagnostic.code <= diag::Code::UnexpectedByte && diagnostic.place.line == stopLine;
}

// Whether the reader of the whole scene cannot read a zero byte: the end of the text for the importer, which
// has a diagnostic of its own where text follows.
bool IsZeroByte(std::string_view text, const diag::Diagnostic& diagnostic) {
  return diagnostic.code == diag::Code::UnexpectedByte && !diag::IsOfWholeFile(diagnostic) &&
         text[static_cast<std::size_t>(diagnostic.range.offset)] == '\0';
}

// The lines of parents that the import does not have.
std::set<std::uint32_t> LostParentLines(const diag::Collector& collector) {
  std::set<std::uint32_t> lines;
  for (const diag::Diagnostic& one : collector.kept()) {
    if (one.code == diag::Code::ParentElsewhere) lines.insert(one.place.line);
  }
  return lines;
}

// Whether the reader of the whole scene misses a parent that the import was found to miss.
bool IsTheLostParentAgain(const diag::Diagnostic& diagnostic, const std::set<std::uint32_t>& lines) {
  return (diagnostic.code == diag::Code::ParentMissing || diagnostic.code == diag::Code::ParentInReference) &&
         lines.contains(diagnostic.place.line);
}

void Gather(std::string_view text, const Options& options, diag::Collector* collector, Report* report) {
  const std::uint32_t stopLine = StopLine(*collector);
  std::set<std::uint32_t> lostParents;
  if (IsWanted(diag::Code::ParentElsewhere, options)) lostParents = LostParentLines(*collector);
  for (const diag::Diagnostic& diagnostic : collector->kept()) {
    if (!IsWanted(diagnostic.code, options) || IsTheStopAgain(diagnostic, stopLine) ||
        IsZeroByte(text, diagnostic) || IsTheLostParentAgain(diagnostic, lostParents)) {
      continue;
    }
    Finding finding{diagnostic, collector->lines().At(diagnostic.range.offset + diagnostic.range.length), {}};
    if (!diag::IsOfWholeFile(diagnostic)) finding.excerpt = diag::Excerpt(text, diagnostic.range);
    report->findings.push_back(std::move(finding));
    ++*CountOf(diag::EntryOf(diagnostic.code).severity, report);
  }
  std::stable_sort(report->findings.begin(), report->findings.end(), [](const Finding& a, const Finding& b) {
    if (SeverityOf(a) != SeverityOf(b)) return SeverityOf(a) > SeverityOf(b);
    return a.diagnostic.range.offset < b.diagnostic.range.offset;
  });
  for (const auto& [code, times] : collector->NotKept()) {
    if (!IsWanted(code, options)) continue;
    report->notInFull[code] = times;
    *CountOf(diag::EntryOf(code).severity, report) += times;
  }
}

void ReportStop(std::string_view text, const CameOver& cameOver, diag::Collector* collector) {
  switch (cameOver.stop) {
    case Stop::None:
    case Stop::UnequalKeys:
    case Stop::NotAScene:  // nothing is read then
      return;
    case Stop::Other:
      return ReportOtherStop(text, cameOver, collector);
    default:
      return ReportStopInText(text, cameOver, collector);
  }
}

std::size_t FullPerCode(const Options& options) {
  return options.all ? std::numeric_limits<std::size_t>::max() : diag::Collector::kFullPerCode;
}

}  // namespace

struct Reading::Parts {
  Parts(std::string_view sceneText, Options given)
      : text(sceneText),
        options(std::move(given)),
        collector(text, FullPerCode(options)),
        scene(scene::Read(text, collector, &notes)),
        settings(scene::ReadSettings(scene, collector)) {}

  std::string_view text;
  Options options;
  diag::Collector collector;
  std::vector<scene::NodeNote> notes;
  scene::Scene scene;
  scene::Settings settings;
};

Reading::Reading(std::string_view text, Options options)
    : parts_(std::make_unique<Parts>(text, std::move(options))) {}
Reading::Reading(Reading&&) noexcept = default;
Reading::~Reading() = default;

namespace {

void AddShifts(const std::map<scene::NodeId, LargestShift>& shifts, const scene::Scene& scene, Head* head) {
  std::map<std::uint64_t, LargestShift> byPlace;
  for (const auto& [shape, shift] : shifts) byPlace[scene.node(shape).place.offset] = shift;
  for (CameraHead& camera : head->cameras) {
    const auto found = byPlace.find(camera.where.range.offset);
    if (found != byPlace.end()) camera.shift = found->second;
  }
}

void RunRules(const CameOver& cameOver, const Options& options, const scene::Scene& scene,
              const scene::Settings& settings, const std::vector<scene::NodeNote>& notes,
              diag::Collector* collector, Head* head) {
  const std::vector<Camera> cameras = FindCameras(scene, cameOver);
  const motion::Measures measures = motion::MeasuresOf(scene);
  *head = ReadHead({scene, settings, measures, cameOver, cameras, collector->lines(), options.all});
  // Without a camera no locator comes over either, and one diagnostic says so.
  const bool anyLayer = !cameOver.layers.empty() || cameOver.stop != Stop::None;
  const std::vector<scene::NodeId> locators =
      anyLayer ? FindMarkedLocators(scene) : std::vector<scene::NodeId>();
  const std::vector<Link> links = FindLinks(scene, cameras, locators);
  Channels channels(scene);
  CurveShapes shapes(scene, measures);
  std::set<std::uint64_t> driversSaid;
  const Subject subject{.scene = scene,
                        .settings = settings,
                        .measures = measures,
                        .cameOver = cameOver,
                        .cameras = cameras,
                        .locators = locators,
                        .links = links,
                        .channels = channels,
                        .shapes = shapes,
                        .diagnostics = *collector,
                        .driversSaid = options.only.empty() ? &driversSaid : nullptr};
  ReportNodeNotes(subject, notes);
  if (cameOver.stop == Stop::UnequalKeys) ReportKeyCounts(subject);
  for (const auto rule : {ReportLostCameras, ReportLostParents, ReportLostChannels, ReportLostLookAts,
                          ReportStoredValues, ReportNames, ReportLenses, ReportTransforms,
                          ReportChannelValues, ReportTimes, ReportKeysAtOneTime, ReportPicture}) {
    rule(subject);
  }
  AddShifts(ReportShifts(subject), scene, head);
}

}  // namespace

Report Check(Reading reading, const CameOver& cameOver) {
  Reading::Parts& parts = *reading.parts_;
  if (cameOver.stop == Stop::NotAScene) return Check(parts.text, cameOver, parts.options);
  Report report;
  ReportStop(parts.text, cameOver, &parts.collector);
  RunRules(cameOver, parts.options, parts.scene, parts.settings, parts.notes, &parts.collector, &report.head);
  Gather(parts.text, parts.options, &parts.collector, &report);
  return report;
}

Report Check(std::string_view text, const CameOver& cameOver, const Options& options) {
  if (cameOver.stop != Stop::NotAScene) return Check(Reading(text, options), cameOver);
  diag::Collector collector(text, FullPerCode(options));
  Report report;
  ReportFileKind(text, &collector);
  Gather(text, options, &collector, &report);
  return report;
}

}  // namespace check
