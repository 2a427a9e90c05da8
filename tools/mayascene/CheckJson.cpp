#include "tools/mayascene/CheckJson.h"

#include <string_view>

#include "tools/mayascene/CheckHeadJson.h"
#include "tools/mayascene/JsonMembers.h"

namespace mayascene {
namespace {

constexpr std::string_view kFormat = "mayascene-check-report";
constexpr std::int64_t kVersionOfForm = 1;

void writeFinding(text::JsonWriter& json, const check::Finding& finding) {
  const diag::Diagnostic& diagnostic = finding.diagnostic;
  beginDiagnostic(json, diagnostic);
  writeTexts(json, "arguments", diagnostic.arguments);
  json.key("range");
  if (diag::IsOfWholeFile(diagnostic)) {
    json.null();
  } else {
    writeRange(json, diagnostic.range, diagnostic.place, finding.end);
  }
  json.endObject();
}

void writeReport(text::JsonWriter& json, const check::Report& report) {
  writeCount(json, "errors", report.errors);
  writeCount(json, "warnings", report.warnings);
  writeCount(json, "notes", report.notes);
  json.key("head");
  writeHead(json, report.head);
  json.key("diagnostics");
  json.beginArray();
  for (const check::Finding& finding : report.findings) writeFinding(json, finding);
  json.endArray();
  json.key("notInFull");
  json.beginObject();
  for (const auto& [code, times] : report.notInFull) writeCount(json, diag::NameOf(code), times);
  json.endObject();
}

}  // namespace

void writeCheckedScene(text::JsonWriter& json, const CheckedScene& scene) {
  json.beginObject();
  writeText(json, "path", scene.path);
  writeCount(json, "status", static_cast<std::uint64_t>(scene.status));
  json.key("failure");
  scene.failure.empty() ? json.null() : json.text(scene.failure);
  writeReport(json, scene.report);
  json.endObject();
}

CheckJson::CheckJson(std::ostream& out) : out_(out), json_(out) {
  beginReport(json_, kFormat, kVersionOfForm);
  json_.key("scenes");
  json_.beginArray();
}

void CheckJson::end() {
  json_.endArray();
  json_.endObject();
  out_ << '\n';
}

}  // namespace mayascene
