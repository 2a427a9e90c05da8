// mayascene import
#pragma once

#include "tools/mayascene/Arguments.h"
#include "tools/mayascene/Diagnostics.h"
#include "tools/mayascene/ExitStatus.h"

namespace mayascene {

// Imports the scenes into one project, prints an outline of each, and writes what was asked for.
ExitStatus runImport(const ImportArguments& arguments, Diagnostics& diagnostics);

}  // namespace mayascene
