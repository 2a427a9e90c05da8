// mayascene check: says what an import makes of scenes, and why.
#pragma once

#include "tools/mayascene/Arguments.h"
#include "tools/mayascene/Diagnostics.h"
#include "tools/mayascene/ExitStatus.h"

namespace mayascene {

// Reports on standard output, unless the JSON goes there.
ExitStatus runCheck(const CheckArguments& arguments, Diagnostics& diagnostics);

}  // namespace mayascene
