// The head of a check's report as JSON.
#pragma once

#include "check/Head.h"
#include "text/JsonWriter.h"

namespace mayascene {

// Null where the file is no scene.
void writeHead(text::JsonWriter& json, const check::Head& head);

// Bytes, and lines and columns of the first byte and after the last one.
void writeRange(text::JsonWriter& json, const diag::Range& range, const diag::LineAndColumn& begin,
                const diag::LineAndColumn& end);

}  // namespace mayascene
