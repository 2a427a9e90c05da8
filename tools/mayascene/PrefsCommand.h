// mayascene prefs
#pragma once

#include "tools/mayascene/Arguments.h"
#include "tools/mayascene/Diagnostics.h"
#include "tools/mayascene/ExitStatus.h"

namespace mayascene {

// Sets the preference if a value is given. Prints it and where it is stored. Writes nothing without a value.
ExitStatus runPrefs(const PrefsArguments& arguments, Diagnostics& diagnostics);

}  // namespace mayascene
