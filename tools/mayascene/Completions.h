// The completions that shells propose while a command is typed.
#pragma once

#include <string>

#include "tools/mayascene/CommandTable.h"

namespace mayascene {

// Each is a whole file, for the shell to source: verbs, options, the words that an option takes, and files.
std::string bashCompletion(const CommandTable& tool);
std::string zshCompletion(const CommandTable& tool);
std::string fishCompletion(const CommandTable& tool);

}  // namespace mayascene
