// The lines that the tool writes to standard error.
#pragma once

#include <ostream>
#include <string>
#include <string_view>

#include "diag/Diagnostic.h"
#include "refhost/Host.h"
#include "tools/mayascene/ExitStatus.h"
#include "tools/mayascene/TerminalText.h"

namespace mayascene {

enum class Volume {
  Quiet,  // errors only
  Usual,
  Verbose,  // what an import keeps by design, too
};

class Diagnostics {
 public:
  // The stream outlives the object.
  Diagnostics(std::ostream& stream, Style style, Volume volume);

  // "mayascene: SUBJECT: SENTENCE"; without the subject where that is empty. Both may hold anything.
  void complain(std::string_view subject, std::string_view sentence);
  void remark(std::string_view subject, std::string_view sentence);  // not when quiet

  // The last line about a scene; also when quiet.
  void close(std::string_view subject, std::string_view sentence);

  // A diagnostic of a scene in the form "file:line:column: warning: sentence [code]", and what to do. When
  // quiet, errors only.
  void show(std::string_view file, const diag::Diagnostic& diagnostic);

  // Shows what was wrong with a callback: the code that it returned, what the host refused, what it left
  // behind. The file object that every import keeps is shown only when verbose. Refused where the code is not
  // 0 or the ledger is not clean.
  ExitStatus judge(std::string_view subject, const refhost::CallbackResult& result);

  // The messages that the host showed, for runs that print no outline.
  void messages(std::string_view subject, const refhost::CallbackResult& result);

 private:
  void line(std::string_view subject, std::string_view sentence, bool alarming);

  std::ostream& stream_;
  Style style_;
  Volume volume_;
};

}  // namespace mayascene
