// Whether the layers of an import differ from the scene in something that the report does not say.
#pragma once

#include <string>
#include <string_view>

#include "check/Check.h"

namespace check_test {

// How much was compared.
struct Compared {
  std::size_t scenes = 0;
  std::size_t layers = 0;
  std::size_t channels = 0;
  std::size_t keys = 0;
  std::size_t stops = 0;
};

// What differs, and which node; empty where all that differs is explained. The import ran to its end, and the
// report has every diagnostic in full.
std::string LayerContradictionIn(std::string_view text, const check::CameOver& cameOver,
                                 const check::Report& report, Compared* compared);

}  // namespace check_test
