// Whether the report of a check says another thing of where the import stopped than the import.
#pragma once

#include <string>

#include "check/Check.h"

namespace check_test {

// What is contradicted, in words; empty where nothing is. Of a scene that is not `wellFormed`, a report may
// give the import's own code alone.
std::string StopContradictionIn(const check::CameOver& cameOver, const check::Report& report,
                                bool wellFormed);

}  // namespace check_test
