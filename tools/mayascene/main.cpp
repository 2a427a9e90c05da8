// The command-line tool: reads arguments, runs one command, ends with its status.
#include <unistd.h>

#include <exception>
#include <iostream>
#include <new>

#include "tools/mayascene/Arguments.h"
#include "tools/mayascene/Diagnostics.h"
#include "tools/mayascene/ImportCommand.h"
#include "tools/mayascene/Interruption.h"
#include "tools/mayascene/PrefsCommand.h"
#include "tools/mayascene/VerifyCommand.h"

namespace {

using mayascene::Arguments;
using mayascene::Diagnostics;
using mayascene::ExitStatus;

ExitStatus run(int argc, const char* const* argv) {
  const Arguments arguments = mayascene::parseArguments(argc, argv, std::cout, std::cerr);
  const bool quiet =
      (arguments.import && arguments.import->quiet) || (arguments.verify && arguments.verify->quiet);
  Diagnostics diagnostics(std::cerr, mayascene::Style(mayascene::colourAllowed(STDERR_FILENO)), quiet);
  if (arguments.import) return mayascene::runImport(*arguments.import, diagnostics);
  if (arguments.verify) return mayascene::runVerify(*arguments.verify, diagnostics);
  if (arguments.prefs) return mayascene::runPrefs(*arguments.prefs, diagnostics);
  return arguments.over;
}

}  // namespace

int main(int argc, char** argv) {
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
