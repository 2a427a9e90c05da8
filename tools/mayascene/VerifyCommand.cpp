#include "tools/mayascene/VerifyCommand.h"

#include <memory>
#include <string>

#include "tools/mayascene/HostSession.h"
#include "tools/mayascene/OutputFile.h"
#include "tools/mayascene/SceneFile.h"
#include "tools/mayascene/TerminalText.h"

namespace mayascene {
namespace {

ExitStatus verifyOne(const std::string& path, HostSession& session, OutputFile* answers,
                     Diagnostics& diagnostics) {
  const SceneLook look = lookAtScene(path);
  if (!look.readable) {
    diagnostics.complain(path, look.failure);
    return ExitStatus::Unreadable;
  }
  const refhost::CallbackResult result = session.host().verifyScene(path);
  if (answers != nullptr) {
    answers->stream() << terminalText(path) << (result.canImport ? ": taken\n" : ": not taken\n")
                      << std::flush;
  }
  diagnostics.messages(path, result);
  const ExitStatus status = diagnostics.judge(path, result);
  return result.canImport ? status : ExitStatus::Refused;
}

}  // namespace

ExitStatus runVerify(const VerifyArguments& arguments, Diagnostics& diagnostics) {
  std::unique_ptr<OutputFile> answers, trace;
  std::string failure;
  const std::string& traceName = arguments.host.trace;
  if (!traceName.empty()) trace = OutputFile::openLog(traceName, &failure);
  if (!arguments.quiet && traceName != kStandardOutput) answers = OutputFile::open(kStandardOutput, &failure);
  if (!failure.empty()) {
    diagnostics.complain("", failure);
    return ExitStatus::CannotWrite;
  }
  HostSession session(arguments.host, refhost::Callback::Verify, trace ? &trace->stream() : nullptr,
                      diagnostics);
  ExitStatus status = session.start();
  if (status <= ExitStatus::Refused) {
    for (const std::string& path : arguments.scenes) {
      status = worse(status, verifyOne(path, session, answers.get(), diagnostics));
    }
    status = worse(status, session.finish());
  }
  for (OutputFile* output : {answers.get(), trace.get()}) {
    if (output == nullptr || output->commit(&failure)) continue;
    diagnostics.complain("", failure);
    status = worse(status, ExitStatus::CannotWrite);
  }
  return status;
}

}  // namespace mayascene
