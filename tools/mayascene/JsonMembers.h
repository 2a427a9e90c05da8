// The parts that all reports in JSON share: members of an object, the beginning of a report and of a
// diagnostic.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "diag/Diagnostic.h"
#include "text/JsonWriter.h"

namespace mayascene {

void writeText(text::JsonWriter& json, std::string_view key, std::string_view text);
void writeTexts(text::JsonWriter& json, std::string_view key, const std::vector<std::string>& texts);
void writeNumber(text::JsonWriter& json, std::string_view key, double number);
void writeCount(text::JsonWriter& json, std::string_view key, std::uint64_t count);
void writeTruth(text::JsonWriter& json, std::string_view key, bool truth);

// The object of a report, with its format and version. The caller ends it.
void beginReport(text::JsonWriter& json, std::string_view format, std::int64_t version);

// The object of a diagnostic, with code, severity, sentence and help. The caller adds its place, and ends it.
void beginDiagnostic(text::JsonWriter& json, const diag::Diagnostic& diagnostic);

}  // namespace mayascene
