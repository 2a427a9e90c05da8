#include "tools/mayascene/BakeReportJson.h"

#include <string_view>

#include "diag/Diagnostic.h"
#include "tools/mayascene/JsonMembers.h"

namespace mayascene {
namespace {

constexpr std::string_view kFormat = "mayascene-bake-report";
constexpr std::int64_t kVersionOfForm = 1;

void writeFrames(text::JsonWriter& json, const std::optional<bake::FrameRange>& frames) {
  json.key("frames");
  if (!frames) return json.null();
  json.beginObject();
  writeNumber(json, "first", frames->first);
  writeNumber(json, "last", frames->Last());
  writeNumber(json, "step", frames->step);
  writeCount(json, "count", frames->count);
  json.endObject();
}

void writeCamera(text::JsonWriter& json, const bake::CameraReport& camera) {
  json.beginObject();
  writeText(json, "path", camera.path);
  json.key("name");
  camera.written ? json.text(camera.name) : json.null();
  writeText(json, "method", camera.method == bake::Method::kWorld ? "world" : "hierarchy");
  writeTruth(json, "written", camera.written);
  writeTruth(json, "moves", camera.moves);
  writeTruth(json, "lensMoves", camera.lensMoves);
  writeTexts(json, "differences", camera.differences);
  json.endObject();
}

void writeDiagnostic(text::JsonWriter& json, const diag::Diagnostic& diagnostic) {
  beginDiagnostic(json, diagnostic);
  writeCount(json, "line", diagnostic.place.line);
  writeCount(json, "column", diagnostic.place.column);
  writeCount(json, "offset", diagnostic.range.offset);
  writeCount(json, "length", diagnostic.range.length);
  json.endObject();
}

void writeScene(text::JsonWriter& json, const BakedScene& scene) {
  json.beginObject();
  writeText(json, "path", scene.path);
  json.key("output");
  scene.output.empty() ? json.null() : json.text(scene.output);
  writeCount(json, "status", static_cast<std::uint64_t>(scene.status));
  writeFrames(json, scene.report.frames);
  json.key("cameras");
  json.beginArray();
  for (const bake::CameraReport& camera : scene.report.cameras) writeCamera(json, camera);
  json.endArray();
  writeCount(json, "locators", scene.report.locators);
  writeCount(json, "locatorsLeftOut", scene.report.locatorsLeftOut);
  writeCount(json, "errors", scene.errors);
  writeCount(json, "warnings", scene.warnings);
  writeCount(json, "notes", scene.notes);
  json.key("diagnostics");
  json.beginArray();
  for (const diag::Diagnostic& diagnostic : scene.diagnostics) writeDiagnostic(json, diagnostic);
  json.endArray();
  json.endObject();
}

}  // namespace

void writeBakeReport(std::ostream& out, const std::vector<BakedScene>& scenes) {
  text::JsonWriter json(out);
  beginReport(json, kFormat, kVersionOfForm);
  json.key("scenes");
  json.beginArray();
  for (const BakedScene& scene : scenes) writeScene(json, scene);
  json.endArray();
  json.endObject();
  out << '\n';
}

ExitStatus commitBakeReport(OutputFile* output, const std::vector<BakedScene>& scenes,
                            Diagnostics& diagnostics) {
  std::string failure;
  writeBakeReport(output->stream(), scenes);
  if (output->commit(&failure)) return ExitStatus::Done;
  diagnostics.complain("", failure);
  return ExitStatus::CannotWrite;
}

}  // namespace mayascene
