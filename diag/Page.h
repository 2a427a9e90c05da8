// The page about all diagnostics, made from the table.
#pragma once

#include <string>

namespace diag {

// The whole of docs/diagnostics.md.
std::string Page();

}  // namespace diag
