#include "tools/mayascene/Diagnostics.h"

#include <fmt/format.h>

namespace mayascene {
namespace {

// "error 2024 (FILE_CLOSE): the file could not be closed", and ", line 7" where the line of the scene is
// known.
std::string describeFailure(const refhost::CallbackResult& result) {
  const std::string_view name = refhost::errorName(result.code);
  const std::string line = result.line == 0 ? "" : fmt::format(", line {}", result.line);
  if (name.empty()) return fmt::format("error {}: an unknown code{}", result.code, line);
  return fmt::format("error {} ({}): {}{}", result.code, name, refhost::errorSentence(result.code), line);
}

}  // namespace

Diagnostics::Diagnostics(std::ostream& stream, Style style, Volume volume)
    : stream_(stream), style_(style), volume_(volume) {}

void Diagnostics::complain(std::string_view subject, std::string_view sentence) {
  line(subject, sentence, true);
}

void Diagnostics::remark(std::string_view subject, std::string_view sentence) {
  if (volume_ != Volume::Quiet) line(subject, sentence, false);
}

void Diagnostics::close(std::string_view subject, std::string_view sentence) {
  line(subject, sentence, false);
}

void Diagnostics::show(std::string_view file, const diag::Diagnostic& diagnostic) {
  const bool error = diag::EntryOf(diagnostic.code).severity == diag::Severity::Error;
  if (volume_ == Volume::Quiet && !error) return;
  const std::string text = diag::Render(file, diagnostic);
  stream_ << (error ? style_.alarm(text) : text) << std::flush;
}

ExitStatus Diagnostics::judge(std::string_view subject, const refhost::CallbackResult& result) {
  for (const std::string& refusal : result.refusals) complain(subject, "the host refused: " + refusal);
  if (result.code != 0) complain(subject, describeFailure(result));
  for (const refhost::Leftover& leftover : result.leftovers) {
    if (leftover.importFile && volume_ != Volume::Verbose) continue;
    if (leftover.keptByDesign) {
      remark(subject, "kept by design: " + leftover.description);
    } else {
      complain(subject, "left behind: " + leftover.description);
    }
  }
  return result.code == 0 && result.ledgerClean() ? ExitStatus::Done : ExitStatus::Refused;
}

void Diagnostics::messages(std::string_view subject, const refhost::CallbackResult& result) {
  for (const std::string& message : result.messages) complain(subject, "message: " + message);
}

void Diagnostics::line(std::string_view subject, std::string_view sentence, bool alarming) {
  stream_ << "mayascene: ";
  if (!subject.empty()) stream_ << terminalText(subject) << ": ";
  const std::string text = terminalText(sentence);
  stream_ << (alarming ? style_.alarm(text) : text) << '\n' << std::flush;
}

}  // namespace mayascene
