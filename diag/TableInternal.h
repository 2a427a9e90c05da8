// The parts of the table, one per topic.
#pragma once

#include <span>

#include "diag/Codes.h"

namespace diag {

std::span<const Entry> ReadingCodes();
std::span<const Entry> NodeCodes();
std::span<const Entry> CurveCodes();
std::span<const Entry> DriverCodes();
std::span<const Entry> CameraCodes();
std::span<const Entry> BakeCodes();
std::span<const Entry> StopCodes();
std::span<const Entry> LossCodes();
std::span<const Entry> PictureCodes();
std::span<const Entry> ProcessCodes();
std::span<const Entry> ExportCodes();

}  // namespace diag
