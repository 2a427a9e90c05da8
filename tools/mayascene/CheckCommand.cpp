#include "tools/mayascene/CheckCommand.h"

#include <unistd.h>

#include <memory>
#include <string>
#include <utility>

#include "tools/mayascene/CheckJson.h"
#include "tools/mayascene/CheckText.h"
#include "tools/mayascene/HostSession.h"
#include "tools/mayascene/OutputFile.h"
#include "tools/mayascene/SceneCheck.h"

namespace mayascene {
namespace {

// The outputs of a run; each is null where there is none.
struct Outputs {
  std::unique_ptr<OutputFile> report, json;

  bool open(const CheckArguments& arguments, std::string* failure) {
    if (arguments.json != kStandardOutput) report = OutputFile::open(kStandardOutput, failure);
    if (arguments.json != kStandardOutput && report == nullptr) return false;
    if (!arguments.json.empty()) json = OutputFile::open(arguments.json, failure);
    return arguments.json.empty() || json != nullptr;
  }

  ExitStatus commit(Diagnostics& diagnostics) {
    ExitStatus status = ExitStatus::Done;
    for (OutputFile* output : {report.get(), json.get()}) {
      std::string failure;
      if (output == nullptr || output->commit(&failure)) continue;
      diagnostics.complain("", failure);
      status = ExitStatus::CannotWrite;
    }
    return status;
  }
};

ExitStatus checkAll(const CheckArguments& arguments, HostSession& session, Outputs& outputs,
                    Diagnostics& diagnostics) {
  const Style style(colourAllowed(STDOUT_FILENO));
  std::unique_ptr<CheckJson> json;
  if (outputs.json) json = std::make_unique<CheckJson>(outputs.json->stream());
  ExitStatus status = ExitStatus::Done;
  bool first = true;
  for (const std::string& path : arguments.scenes) {
    CheckedScene scene = checkScene(path, arguments.options, session, diagnostics);
    if (arguments.strict && scene.report.warnings != 0)
      scene.status = worse(scene.status, ExitStatus::Refused);
    if (outputs.report && scene.failure.empty()) {
      std::ostream& out = outputs.report->stream();
      if (!std::exchange(first, false) && !arguments.quiet) out << '\n';
      printCheck(out, scene, arguments.quiet, style);
      out.flush();
    }
    if (json) json->add(scene);
    if (arguments.verbose && scene.failure.empty()) diagnostics.remark(path, totalsText(scene.report));
    status = worse(status, scene.status);
  }
  if (json) json->end();
  return status;
}

}  // namespace

ExitStatus runCheck(const CheckArguments& arguments, Diagnostics& diagnostics) {
  Outputs outputs;
  std::string failure;
  if (!outputs.open(arguments, &failure)) {
    diagnostics.complain("", failure);
    return ExitStatus::CannotWrite;
  }
  HostSession session(arguments.host, refhost::Callback::Import, nullptr, diagnostics);
  ExitStatus status = session.start();
  if (status > ExitStatus::Refused) return status;
  status = worse(status, checkAll(arguments, session, outputs, diagnostics));
  status = worse(status, session.finish());
  return worse(status, outputs.commit(diagnostics));
}

}  // namespace mayascene
