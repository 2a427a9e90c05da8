// The embedded host of one run: set up from the command line, loaded with the importer, and ended.
#pragma once

#include <filesystem>
#include <memory>
#include <ostream>

#include "refhost/Host.h"
#include "tools/mayascene/Arguments.h"
#include "tools/mayascene/Diagnostics.h"
#include "tools/mayascene/ExitStatus.h"

namespace mayascene {

class HostSession {
 public:
  // `own` is the callback of a rehearsal, unless the user names another. The trace may be null; it and the
  // diagnostics outlive the session.
  HostSession(const HostArguments& arguments, refhost::Callback own, std::ostream* trace,
              Diagnostics& diagnostics);

  // Loads the importer. Done, or what ends the run: Unreadable for translations that cannot be read,
  // NoModule. Refused: it is loaded, but its entry left something behind.
  ExitStatus start();

  // Calls the death hook. Refused where it returned a code or left something behind.
  ExitStatus finish();

  refhost::Host& host() { return *host_; }  // after start()
  const refhost::CallbackResult& entry() const { return entry_; }
  const refhost::CallbackResult& deathHook() const { return deathHook_; }

 private:
  const HostArguments& arguments_;
  refhost::Callback own_;
  std::ostream* trace_;
  Diagnostics& diagnostics_;
  std::unique_ptr<refhost::Host> host_;
  refhost::CallbackResult entry_;
  refhost::CallbackResult deathHook_;
};

// The store that is used where the user names none.
std::filesystem::path preferenceFile(const std::string& named);

}  // namespace mayascene
