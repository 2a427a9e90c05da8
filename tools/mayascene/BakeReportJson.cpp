#include "tools/mayascene/BakeReportJson.h"

#include <string_view>

#include "diag/Codes.h"
#include "diag/Diagnostic.h"
#include "text/JsonWriter.h"

namespace mayascene {
namespace {

constexpr std::string_view kFormat = "mayascene-bake-report";
constexpr std::int64_t kVersionOfForm = 1;

void writeText(text::JsonWriter& json, std::string_view key, std::string_view text) {
  json.key(key);
  json.text(text);
}

void writeCount(text::JsonWriter& json, std::string_view key, std::uint64_t count) {
  json.key(key);
  json.integer(static_cast<std::int64_t>(count));
}

void writeTruth(text::JsonWriter& json, std::string_view key, bool truth) {
  json.key(key);
  json.boolean(truth);
}

void writeFrames(text::JsonWriter& json, const std::optional<bake::FrameRange>& frames) {
  json.key("frames");
  if (!frames) return json.null();
  json.beginObject();
  json.key("first");
  json.number(frames->first);
  json.key("last");
  json.number(frames->Last());
  json.key("step");
  json.number(frames->step);
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
  json.key("differences");
  json.beginArray();
  for (const std::string& difference : camera.differences) json.text(difference);
  json.endArray();
  json.endObject();
}

void writeDiagnostic(text::JsonWriter& json, const diag::Diagnostic& diagnostic) {
  json.beginObject();
  writeText(json, "code", diag::NameOf(diagnostic.code));
  writeText(json, "severity", diag::NameOf(diag::EntryOf(diagnostic.code).severity));
  writeText(json, "sentence", diag::SentenceOf(diagnostic));
  writeText(json, "help", diag::HelpOf(diagnostic));
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
  json.beginObject();
  writeText(json, "format", kFormat);
  json.key("version");
  json.integer(kVersionOfForm);
  json.key("scenes");
  json.beginArray();
  for (const BakedScene& scene : scenes) writeScene(json, scene);
  json.endArray();
  json.endObject();
  out << '\n';
}

}  // namespace mayascene
