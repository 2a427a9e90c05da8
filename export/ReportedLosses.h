// What more than one format cannot say, reported.
#pragma once

#include <string_view>

#include "diag/Collector.h"
#include "export/Composition.h"

namespace interchange {

// Names with bytes that are no valid UTF-8, and cameras under scale that programs do not read alike. `format`
// is the name that the user knows.
void ReportCommonLosses(const Composition& composition, std::string_view format,
                        diag::Collector* diagnostics);

// Cameras under uneven scale, for a format that has no place for scale.
void ReportLostScales(const Composition& composition, diag::Collector* diagnostics);

// Pixel aspect, film offsets and squeezes, for a format that has a place for none of them.
void ReportLostExtras(const Composition& composition, diag::Collector* diagnostics);

}  // namespace interchange
