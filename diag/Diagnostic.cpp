#include "diag/Diagnostic.h"

#include <fmt/format.h>

#include <algorithm>
#include <cstddef>

#include "diag/Fill.h"
#include "diag/ShownText.h"

namespace diag {
namespace {

// A missing argument shows as nothing.
std::string FilledBy(const Diagnostic& diagnostic, std::string_view text) {
  std::vector<std::string> arguments = diagnostic.arguments;
  arguments.resize(std::max(arguments.size(), ArgumentCount(EntryOf(diagnostic.code))));
  return Fill(text, arguments);
}

}  // namespace

std::string SentenceOf(const Diagnostic& diagnostic) {
  return FilledBy(diagnostic, EntryOf(diagnostic.code).sentence);
}

std::string HelpOf(const Diagnostic& diagnostic) {
  return FilledBy(diagnostic, EntryOf(diagnostic.code).help);
}

bool IsOfWholeFile(const Diagnostic& diagnostic) { return diagnostic.range == Range{}; }

std::string HeadLineOf(std::string_view file, const Diagnostic& diagnostic) {
  const auto& place = diagnostic.place;
  const std::string where =
      IsOfWholeFile(diagnostic) ? " " : fmt::format("{}:{}: ", place.line, place.column);
  return fmt::format("{}:{}{}: {} [{}]", ShownText(file), where, NameOf(EntryOf(diagnostic.code).severity),
                     SentenceOf(diagnostic), NameOf(diagnostic.code));
}

std::string HelpLineOf(const Diagnostic& diagnostic) { return "help: " + HelpOf(diagnostic); }

std::string Render(std::string_view file, const Diagnostic& diagnostic) {
  return HeadLineOf(file, diagnostic) + '\n' + HelpLineOf(diagnostic) + '\n';
}

}  // namespace diag
