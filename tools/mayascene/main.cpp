// The command-line tool: reads arguments, runs one command, ends with its status.
#include <fcntl.h>
#include <unistd.h>

#include <cerrno>
#include <exception>
#include <iostream>
#include <new>

#include "refhost/ProcessMemory.h"
#include "tools/mayascene/Arguments.h"
#include "tools/mayascene/BakeCommand.h"
#include "tools/mayascene/CheckCommand.h"
#include "tools/mayascene/Diagnostics.h"
#include "tools/mayascene/ExportCommand.h"
#include "tools/mayascene/ImportCommand.h"
#include "tools/mayascene/Interruption.h"
#include "tools/mayascene/PrefsCommand.h"
#include "tools/mayascene/VerifyCommand.h"

namespace {

using mayascene::Arguments;
using mayascene::Diagnostics;
using mayascene::ExitStatus;
using mayascene::Volume;

ExitStatus run(int argc, const char* const* argv) {
  const Arguments arguments = mayascene::parseArguments(argc, argv, std::cout, std::cerr);
  const bool quiet =
      (arguments.import && arguments.import->quiet) || (arguments.verify && arguments.verify->quiet) ||
      (arguments.bake && arguments.bake->quiet) || (arguments.check && arguments.check->quiet) ||
      (arguments.exported && arguments.exported->quiet);
  const bool colour =
      mayascene::colourAllowed(STDERR_FILENO) || (arguments.check && arguments.check->colourComplaints);
  const bool verbose = arguments.import && arguments.import->verbose;
  const Volume volume = quiet ? Volume::Quiet : verbose ? Volume::Verbose : Volume::Usual;
  Diagnostics diagnostics(std::cerr, mayascene::Style(colour), volume);
  if (arguments.import) return mayascene::runImport(*arguments.import, diagnostics);
  if (arguments.bake) return mayascene::runBake(*arguments.bake, diagnostics);
  if (arguments.exported) return mayascene::runExport(*arguments.exported, diagnostics);
  if (arguments.check) return mayascene::runCheck(*arguments.check, diagnostics);
  if (arguments.verify) return mayascene::runVerify(*arguments.verify, diagnostics);
  if (arguments.prefs) return mayascene::runPrefs(*arguments.prefs, diagnostics);
  return arguments.over;
}

// A closed standard stream leaves its number to the first file that the run opens, and text for the stream
// would go into that file. So the number is taken, read-only: writing to the stream still fails.
void holdStandardDescriptors() {
  for (const int descriptor : {STDIN_FILENO, STDOUT_FILENO, STDERR_FILENO}) {
    const bool closed = ::fcntl(descriptor, F_GETFD) < 0 && errno == EBADF;
    // The lowest free number is this one: those below it are taken.
    if (closed && ::open("/dev/null", O_RDONLY) < 0) return;
  }
}

}  // namespace

int main(int argc, char** argv) {
  holdStandardDescriptors();
  refhost::useLargePages();
  mayascene::handleInterruptions();
  ExitStatus status = ExitStatus::CannotWrite;
  try {
    status = run(argc, argv);
  } catch (const std::bad_alloc&) {
    std::cerr << "mayascene: the memory is exhausted\n";
  } catch (const std::exception& unexpected) {
    std::cerr << "mayascene: an unexpected failure: " << mayascene::terminalText(unexpected.what()) << '\n';
  }
  return static_cast<int>(status);
}
