// What the entry and the verify callback come to when something in them fails, derived from a run in which
// nothing does.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

#include "tests/support/FailureModel.h"

namespace testsupport {

// What a callback is expected to come to.
struct Outcome {
  HostError code = 0;
  bool canImport = false;
  std::vector<std::string> calls;
  HostError reported = 0;  // the code of the one message; 0: there is none
  std::size_t files = 0;   // left behind, because their own end was made to fail
};

class CallbackModel {
 public:
  // Of the good run its calls and what it came to.
  CallbackModel(std::vector<std::string> calls, HostError code, bool canImport);

  const std::vector<std::string>& good() const { return good_; }

  // When call `index` (from 0) fails, or with `onwards` every call from it on.
  Outcome WhereCallsFail(std::size_t index, const Way& way, bool onwards) const;

  // When a service fails after so many calls of the good run.
  Outcome WhereAServiceFails(std::string_view service, std::size_t place, const Way& way) const;

 private:
  HostError CodeAfter(const Way& way) const;
  std::vector<std::string> FirstCalls(std::size_t count) const;
  std::vector<std::string> CallsWithoutImporter() const;

  std::vector<std::string> good_;
  HostError goodCode_;
  bool canImport_;
};

}  // namespace testsupport
