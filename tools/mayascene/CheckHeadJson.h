// The head of a check's report as JSON.
#pragma once

#include "check/Head.h"
#include "text/JsonWriter.h"

namespace mayascene {

// Null where the file is not a scene.
void writeHead(text::JsonWriter& json, const check::Head& head);

// The range in bytes; line and column of its first byte, and of the byte after its last one.
void writeRange(text::JsonWriter& json, const diag::Range& range, const diag::LineAndColumn& begin,
                const diag::LineAndColumn& end);

}  // namespace mayascene
