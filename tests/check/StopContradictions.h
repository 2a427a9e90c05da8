// Whether the report of a check and the import disagree on where the import stopped, and why.
#pragma once

#include <string>

#include "check/Check.h"

namespace check_test {

// The contradiction in words; empty where there is none. The report of a scene that is not `wellFormed` may
// give no more than the import's own code.
std::string StopContradictionIn(const check::CameOver& cameOver, const check::Report& report,
                                bool wellFormed);

}  // namespace check_test
