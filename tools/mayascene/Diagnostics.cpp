#include "tools/mayascene/Diagnostics.h"

namespace mayascene {

Diagnostics::Diagnostics(std::ostream& stream, Style style, bool quiet)
    : stream_(stream), style_(style), quiet_(quiet) {}

void Diagnostics::complain(std::string_view subject, std::string_view sentence) {
  line(subject, sentence, true);
}

void Diagnostics::remark(std::string_view subject, std::string_view sentence) {
  if (!quiet_) line(subject, sentence, false);
}

ExitStatus Diagnostics::judge(std::string_view subject, const refhost::CallbackResult& result) {
  for (const std::string& refusal : result.refusals) complain(subject, "the host refused: " + refusal);
  if (result.code != 0) complain(subject, describeFailure(result));
  for (const refhost::Leftover& leftover : result.leftovers) {
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

std::string describeCode(HostError code) {
  const std::string number = "error " + std::to_string(code);
  const std::string_view name = refhost::errorName(code);
  if (name.empty()) return number + ": a code of no known meaning";
  return number + " (" + std::string(name) + "): " + std::string(refhost::errorSentence(code));
}

std::string describeFailure(const refhost::CallbackResult& result) {
  const std::string place = result.line == 0 ? "" : ", line " + std::to_string(result.line);
  return describeCode(result.code) + place;
}

}  // namespace mayascene
