// `mayascene export`: compositions written for other programs.
#pragma once

#include "tools/mayascene/Arguments.h"
#include "tools/mayascene/Diagnostics.h"
#include "tools/mayascene/ExitStatus.h"

namespace mayascene {

ExitStatus runExport(const ExportArguments& arguments, Diagnostics& diagnostics);

}  // namespace mayascene
