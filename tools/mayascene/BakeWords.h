// The options of a bake on the command line, of `bake` and of `import --bake`.
#pragma once

#include <CLI/CLI.hpp>
#include <string>
#include <vector>

#include "tools/mayascene/BakeCommand.h"

namespace mayascene {

// The words before they are turned into what the bake takes.
struct BakeWords {
  std::string frames, step, locators;
  std::vector<std::string> cameras;
  bool world = false;
  std::string report;
  bool strict = false;
};

// Adds the options to the verb, in a group of their own where it is named.
void addBakeOptions(CLI::App* verb, BakeWords* words, const std::string& group);

// The options that were given, by their names; empty where none was.
std::vector<std::string> givenBakeOptions(const CLI::App& verb);

// Throws CLI::ValidationError for a word that means nothing.
void translateBakeWords(const BakeWords& words, BakeArguments* bake);

// "A:B" or "A". Throws CLI::ValidationError for anything else.
bake::FrameSpan framesOf(const std::string& text);

}  // namespace mayascene
