// Whether the report of a check says another thing than the import that it is about.
#pragma once

#include <string>
#include <string_view>

#include "check/Check.h"

namespace check_test {

// What is contradicted, in words; empty where nothing is. The report has all codes. With `wellFormed`, each
// channel of each camera is looked at too.
std::string ContradictionIn(std::string_view text, const check::CameOver& cameOver,
                            const check::Report& report, bool wellFormed);

}  // namespace check_test
