// The share of the long tests that runs. MAYASCENE_TESTS in the environment chooses it:
//
//   (not set)  a quick share, so that all tests together take about a minute
//   wide       what scripts/test --all runs; under the sanitizers, which take ten times as long, a part of it
//   all        everything, where there is an end to it; else as wide
#pragma once

#include <cstddef>
#include <cstdlib>
#include <string_view>

namespace testsupport {

inline bool AllTestsWanted() {
  const char* const wanted = std::getenv("MAYASCENE_TESTS");
  return wanted != nullptr && std::string_view(wanted) == "all";
}

inline bool WideTestsWanted() {
  const char* const wanted = std::getenv("MAYASCENE_TESTS");
  return AllTestsWanted() || (wanted != nullptr && std::string_view(wanted) == "wide");
}

// For work that has no end, or a late one.
struct Share {
  std::size_t quick;
  std::size_t wide;
  std::size_t sanitized = wide;  // wide, under the sanitizers
};

inline std::size_t HowMany(const Share& share) {
  if (!WideTestsWanted()) return share.quick;
  return MAYASCENE_SANITIZED ? share.sanitized : share.wide;
}

}  // namespace testsupport
