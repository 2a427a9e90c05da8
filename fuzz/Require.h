// How a fuzz target reports a finding.
#pragma once

#include <cstdio>
#include <cstdlib>

namespace fuzz {

// Says which promise was broken, and ends the process, so that the input is kept.
inline void Require(bool holds, const char* promise) {
  if (holds) return;
  std::fprintf(stderr, "BROKEN PROMISE: %s\n", promise);
  std::abort();
}

}  // namespace fuzz
