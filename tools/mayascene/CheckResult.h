// The result of the check of one scene, which a child process hands to its parent.
#pragma once

#include <ostream>
#include <string>
#include <string_view>

#include "tools/mayascene/Arguments.h"
#include "tools/mayascene/ProcessPool.h"
#include "tools/mayascene/SceneCheck.h"

namespace mayascene {

struct CheckResult {
  ExitStatus status = ExitStatus::Unreadable;
  std::string
      totals;  // "2 errors, 1 warning, no notes"; this and the report are empty for an unreadable file
  std::string report;  // for a person
  std::string json;    // the scene's object; empty where no JSON is asked for
};

// Puts a checked scene into words.
CheckResult resultOf(const CheckedScene& scene, const CheckArguments& arguments);

// A child writes the result to its standard output, and its parent reads it there. False where the bytes are
// not one whole result; *result is then unspecified.
void handOver(std::ostream& out, const CheckResult& result);
bool handedOver(std::string_view bytes, CheckResult* result);

// For a child that handed over no result: a scene with one diagnostic, which names the reason. The limits are
// those of the child.
CheckedScene unfinishedCheck(const std::string& path, const ChildEnd& end, const PoolLimits& limits);

}  // namespace mayascene
