// How a run of the tool ends.
#pragma once

#include <algorithm>

namespace mayascene {

// The numbers are the contract with scripts. A run of several scenes ends with the highest of theirs. A run
// that a signal ends has 128 and the number of the signal.
enum class ExitStatus : int {
  Done = 0,         // all imported, all taken, or shown
  Refused = 1,      // a scene was refused, returned a code, or left something behind
  WrongUsage = 2,   // the command line makes no sense
  Unreadable = 3,   // a file cannot be opened, or is no regular file
  NoModule = 4,     // the import module cannot be loaded, or its entry returned a code
  CannotWrite = 5,  // an output cannot be written, or the tool itself ran out of means
};

inline ExitStatus worse(ExitStatus a, ExitStatus b) { return std::max(a, b); }

}  // namespace mayascene
