// What came of the check of one scene, as the process that made it hands it to the one that shows it.
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
  std::string totals;  // "2 errors, 1 warning, no notes"; empty of a file that cannot be read, as is the next
  std::string report;  // for a person
  std::string json;    // the scene's object; empty where no JSON is asked for
};

// Puts a checked scene into words.
CheckResult resultOf(const CheckedScene& scene, const CheckArguments& arguments);

// What a child writes on its standard output, and what its parent reads there. False where the bytes are not
// one whole result; *result then says nothing.
void handOver(std::ostream& out, const CheckResult& result);
bool handedOver(std::string_view bytes, CheckResult* result);

// Of a child that handed no result over: a scene whose one diagnostic says why. The limits are those that the
// child ran in.
CheckedScene unfinishedCheck(const std::string& path, const ChildEnd& end, const PoolLimits& limits);

}  // namespace mayascene
