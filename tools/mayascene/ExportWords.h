// The options of an export on the command line.
#pragma once

#include <CLI/CLI.hpp>
#include <string>

#include "tools/mayascene/Arguments.h"
#include "tools/mayascene/BakeWords.h"

namespace mayascene {

// The words before they are turned into what the export takes.
struct ExportWords {
  std::string format, axes, scale;
  bool bakes = false;
  BakeWords bake;  // its frames and its strictness are the export's too
};

void addExportOptions(CLI::App* verb, ExportWords* words, ExportArguments* arguments);

// Throws CLI::ValidationError for a word that means nothing, and for options that do not go together.
void translateExportWords(const CLI::App& verb, const ExportWords& words, ExportArguments* arguments);

}  // namespace mayascene
