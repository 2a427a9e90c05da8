// mayascene bake: writes scenes anew, with a value at every frame.
#pragma once

#include <string>
#include <vector>

#include "bake/Options.h"
#include "tools/mayascene/Diagnostics.h"
#include "tools/mayascene/ExitStatus.h"

namespace mayascene {

struct BakeArguments {
  bake::Options options;
  std::string words;   // the options as they were given, for the bake's first comment
  std::string report;  // empty: none; "-": standard output
  bool strict = false;
  bool quiet = false;
  std::vector<std::string> scenes;
  std::string output;  // a file, or with several scenes a folder
};

ExitStatus runBake(const BakeArguments& arguments, Diagnostics& diagnostics);

}  // namespace mayascene
