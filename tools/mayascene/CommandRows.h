// From the declarations of the command line library to the tool's own table.
#pragma once

#include <CLI/CLI.hpp>
#include <string>

#include "tools/mayascene/CommandTable.h"

namespace mayascene {

// Options without a group are the tool's own business and are left out. `command`: "mayascene import".
CommandTable tableOf(const CLI::App& app, const std::string& command);

}  // namespace mayascene
