// The one place where an exception becomes a code.
#pragma once

#include <exception>
#include <utility>

#include "hostutil/HostReport.h"
#include "plugin/ErrorCodes.h"

// Runs the work and returns the code that it ended with: 0 when it returned, an integer exception's own
// value, or what the host's translate-and-report makes of a standard exception. Any other exception passes
// through.
template <typename Work>
HostError Guarded(Work&& work) {
  try {
    std::forward<Work>(work)();
    return kNoError;
  } catch (int code) {
    return code;
  } catch (const std::exception& exception) {
    return TranslateAndReport(exception);
  }
}

// Keeps the first code that is not 0.
inline void KeepFirst(HostError* kept, HostError code) {
  if (*kept == kNoError) *kept = code;
}
