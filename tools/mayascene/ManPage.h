// A manual page for each command.
#pragma once

#include <string>

#include "tools/mayascene/CommandTable.h"

namespace mayascene {

// The page of section 1 in the language of man(7). `tool` is the table of the whole tool, for the references
// between pages.
std::string manPage(const CommandTable& table, const CommandTable& tool);

// "mayascene-prefs-set"
std::string manPageName(const CommandTable& table);

}  // namespace mayascene
