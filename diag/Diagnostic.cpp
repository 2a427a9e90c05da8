#include "diag/Diagnostic.h"

#include <fmt/args.h>
#include <fmt/format.h>

#include <algorithm>
#include <cstddef>

#include "diag/ShownText.h"

namespace diag {
namespace {

// Puts the arguments in the places of {0}, {1} …; a missing one shows as nothing.
std::string Fill(std::string_view text, const Diagnostic& diagnostic) {
  const std::vector<std::string>& arguments = diagnostic.arguments;
  fmt::dynamic_format_arg_store<fmt::format_context> shown;
  const std::size_t count = std::max(arguments.size(), ArgumentCount(EntryOf(diagnostic.code)));
  for (std::size_t i = 0; i < count; ++i)
    shown.push_back(i < arguments.size() ? ShownText(arguments[i]) : "");
  return fmt::vformat(text, shown);
}

}  // namespace

std::string SentenceOf(const Diagnostic& diagnostic) {
  return Fill(EntryOf(diagnostic.code).sentence, diagnostic);
}

std::string HelpOf(const Diagnostic& diagnostic) { return Fill(EntryOf(diagnostic.code).help, diagnostic); }

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
