// mayascene verify
#pragma once

#include "tools/mayascene/Arguments.h"
#include "tools/mayascene/Diagnostics.h"
#include "tools/mayascene/ExitStatus.h"

namespace mayascene {

// Prints for each file whether the importer takes it.
ExitStatus runVerify(const VerifyArguments& arguments, Diagnostics& diagnostics);

}  // namespace mayascene
