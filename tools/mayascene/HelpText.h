// What --help and --help-all print.
#pragma once

#include <string>

#include "tools/mayascene/CommandTable.h"

namespace mayascene {

// Examples, what the command does, its options and the exit statuses. `all`: also the options for developers
// of importers and hosts.
std::string helpText(const CommandTable& table, bool all);

}  // namespace mayascene
