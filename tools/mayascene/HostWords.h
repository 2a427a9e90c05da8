// The options of the embedded host on the command line.
#pragma once

#include <CLI/CLI.hpp>
#include <string>
#include <vector>

#include "tools/mayascene/Arguments.h"

namespace mayascene {

// The words before they are turned into what the host takes.
struct HostWords {
  std::vector<std::string> fail, failAt, throwing, throwAt, refuse;
  std::string during;
};

void addPreferences(CLI::App* verb, std::string* file);

// The linear units and the preference store.
void addUnits(CLI::App* verb, HostArguments* host);

// All options of the host except the limits.
void addHostOptions(CLI::App* verb, HostArguments* host, HostWords* words);

void addLimits(CLI::App* verb, HostArguments* host);

// Throws CLI::ValidationError for a word that means nothing.
void translateHostWords(const HostWords& words, HostArguments* host);

}  // namespace mayascene
