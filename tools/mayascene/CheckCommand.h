// mayascene check: reports what comes over from scenes, what does not, and why.
#pragma once

#include "tools/mayascene/Arguments.h"
#include "tools/mayascene/Diagnostics.h"
#include "tools/mayascene/ExitStatus.h"

namespace mayascene {

// Reports on standard output, unless the JSON goes there.
ExitStatus runCheck(const CheckArguments& arguments, Diagnostics& diagnostics);

}  // namespace mayascene
