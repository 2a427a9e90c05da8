// Reports of losses that several formats have in common.
#pragma once

#include <string_view>

#include "diag/Collector.h"
#include "export/Composition.h"

namespace interchange {

// Reports names that are not valid UTF-8, and cameras under uneven scale, which programs read in different
// ways. `format` is the name that the user knows.
void ReportCommonLosses(const Composition& composition, std::string_view format,
                        diag::Collector* diagnostics);

// Reports cameras under uneven scale, for a format that has no place for scale.
void ReportLostScales(const Composition& composition, diag::Collector* diagnostics);

// Reports pixel aspect, film offsets and squeezes, for a format that has no place for them.
void ReportLostExtras(const Composition& composition, diag::Collector* diagnostics);

}  // namespace interchange
