// The codes that the importer itself returns, and the one place where a code becomes an exception.
//
// Inside the parser and the builder a failure is a bare integer exception that carries the code. Guarded (in
// Guarded.h) turns it back. No other file of the importer says "throw", "try" or "catch".
#pragma once

#include "hostapi/ErrorCodes.h"
#include "hostapi/HostTypes.h"

namespace mayaimport {

inline constexpr HostError kNoError = HOST_ERR_NONE;
inline constexpr HostError kNullArgument = HOST_ERR_NULL_ARGUMENT;
inline constexpr HostError kMissingSuite = HOST_ERR_MISSING_SUITE;
inline constexpr HostError kReadingError = HOST_ERR_MAYA_SYNTAX;
inline constexpr HostError kUnexpectedEnd = HOST_ERR_MAYA_UNEXPECTED_END;
inline constexpr HostError kInconsistentKeys = HOST_ERR_MAYA_KEY_COUNTS;

// Throws the code as a bare integer. It may be 0: a host call failed to make an object and gave no reason.
[[noreturn]] inline void ThrowCode(HostError code) { throw int{code}; }

// Throws a code that is not 0.
inline void ThrowOnError(HostError code) {
  if (code != kNoError) ThrowCode(code);
}

}  // namespace mayaimport
