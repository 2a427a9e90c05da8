#include "tools/mayascene/JsonMembers.h"

#include "diag/Codes.h"

namespace mayascene {

void writeText(text::JsonWriter& json, std::string_view key, std::string_view text) {
  json.key(key);
  json.text(text);
}

void writeTexts(text::JsonWriter& json, std::string_view key, const std::vector<std::string>& texts) {
  json.key(key);
  json.beginArray();
  for (const std::string& text : texts) json.text(text);
  json.endArray();
}

void writeNumber(text::JsonWriter& json, std::string_view key, double number) {
  json.key(key);
  json.number(number);
}

void writeCount(text::JsonWriter& json, std::string_view key, std::uint64_t count) {
  json.key(key);
  json.integer(static_cast<std::int64_t>(count));
}

void writeTruth(text::JsonWriter& json, std::string_view key, bool truth) {
  json.key(key);
  json.boolean(truth);
}

void beginReport(text::JsonWriter& json, std::string_view format, std::int64_t version) {
  json.beginObject();
  writeText(json, "format", format);
  json.key("version");
  json.integer(version);
}

void beginDiagnostic(text::JsonWriter& json, const diag::Diagnostic& diagnostic) {
  json.beginObject();
  writeText(json, "code", diag::NameOf(diagnostic.code));
  writeText(json, "severity", diag::NameOf(diag::EntryOf(diagnostic.code).severity));
  writeText(json, "sentence", diag::SentenceOf(diagnostic));
  writeText(json, "help", diag::HelpOf(diagnostic));
}

}  // namespace mayascene
