// The result of a writer for a composition: its files, and its reports.
#pragma once

#include <cstdint>
#include <map>
#include <string>
#include <string_view>

#include "diag/Collector.h"
#include "export/Composition.h"

namespace exporttest {

struct Written {
  bool done = false;
  std::string file;
  std::map<std::string, std::string> beside;  // by name
  std::map<diag::Code, std::uint64_t> counts;
  std::uint64_t errors = 0;

  std::uint64_t CountOf(diag::Code code) const { return counts.contains(code) ? counts.at(code) : 0; }
};

// In a format of the table. `failing`: which of the outputs, counted from 1, cannot be made. `stem`: the name
// of the main output, without a suffix.
Written WriteAs(std::string_view format, const interchange::Composition& composition, std::size_t failing = 0,
                std::string stem = "shot");

}  // namespace exporttest
