// The check of one scene: imports it, reads it, and explains the result.
#pragma once

#include <string>

#include "check/Check.h"
#include "tools/mayascene/Arguments.h"
#include "tools/mayascene/Diagnostics.h"
#include "tools/mayascene/ExitStatus.h"
#include "tools/mayascene/HostSession.h"

namespace mayascene {

struct CheckedScene {
  std::string path;  // as the user named it; bytes
  ExitStatus status = ExitStatus::Unreadable;
  std::string failure;      // why the file cannot be read; empty: it could
  check::Report report;     // of a file that could be read
  bool unfinished = false;  // the check was cut short: the report has no head, and says why
};

// Imports the scene and reports what came over. Complains of a file that cannot be read, and of what the
// import left behind.
CheckedScene checkScene(const std::string& path, const CheckArguments& arguments, HostSession& session,
                        Diagnostics& diagnostics);

}  // namespace mayascene
