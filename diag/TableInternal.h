// The parts of the table, one per topic.
#pragma once

#include <span>

#include "diag/Codes.h"

namespace diag {

std::span<const Entry> ReadingCodes();
std::span<const Entry> NodeCodes();
std::span<const Entry> CurveCodes();
std::span<const Entry> DriverCodes();

}  // namespace diag
