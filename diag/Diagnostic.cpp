#include "diag/Diagnostic.h"

#include <cstddef>

#include "diag/ShownText.h"

namespace diag {
namespace {

// Puts the arguments in the places of {0}, {1} …; one that is not there shows as nothing.
std::string Fill(std::string_view text, const std::vector<std::string>& arguments) {
  std::string filled;
  for (std::size_t at = 0; at < text.size(); ++at) {
    const bool placeholder = text[at] == '{' && at + 2 < text.size() && text[at + 2] == '}' &&
                             text[at + 1] >= '0' && text[at + 1] <= '9';
    if (!placeholder) {
      filled += text[at];
      continue;
    }
    const auto index = static_cast<std::size_t>(text[at + 1] - '0');
    if (index < arguments.size()) filled += ShownText(arguments[index]);
    at += 2;
  }
  return filled;
}

}  // namespace

std::string SentenceOf(const Diagnostic& diagnostic) {
  return Fill(EntryOf(diagnostic.code).sentence, diagnostic.arguments);
}

std::string HelpOf(const Diagnostic& diagnostic) {
  return Fill(EntryOf(diagnostic.code).help, diagnostic.arguments);
}

bool IsOfWholeFile(const Diagnostic& diagnostic) { return diagnostic.range == Range{}; }

std::string HeadLineOf(std::string_view file, const Diagnostic& diagnostic) {
  std::string text = ShownText(file) + ": ";
  if (!IsOfWholeFile(diagnostic)) {
    text.pop_back();
    text += std::to_string(diagnostic.place.line) + ':' + std::to_string(diagnostic.place.column) + ": ";
  }
  text += NameOf(EntryOf(diagnostic.code).severity);
  return text + ": " + SentenceOf(diagnostic) + " [" + NameOf(diagnostic.code) + ']';
}

std::string HelpLineOf(const Diagnostic& diagnostic) { return "help: " + HelpOf(diagnostic); }

std::string Render(std::string_view file, const Diagnostic& diagnostic) {
  return HeadLineOf(file, diagnostic) + '\n' + HelpLineOf(diagnostic) + '\n';
}

}  // namespace diag
