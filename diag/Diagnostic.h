// A diagnostic: what was found, where, and how it is shown.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "diag/Codes.h"
#include "diag/Lines.h"

namespace diag {

// Bytes of the scene's text. A length of 0 is a place between two bytes.
struct Range {
  std::uint64_t offset = 0;
  std::uint64_t length = 0;

  bool operator==(const Range&) const = default;
};

struct Diagnostic {
  Code code{};
  Range range = {};
  LineAndColumn place = {};                 // of the range's first byte
  std::vector<std::string> arguments = {};  // as the file has them: they may hold any bytes

  bool operator==(const Diagnostic&) const = default;
};

// The sentence and the help of its row, with the arguments in place, harmless on a terminal.
std::string SentenceOf(const Diagnostic& diagnostic);
std::string HelpOf(const Diagnostic& diagnostic);

// Whether it is about the file as a whole: offset and length of its range are 0.
bool IsOfWholeFile(const Diagnostic& diagnostic);

// "file:line:column: warning: sentence [MA0101]", and "help: …": a line each, without line ends. A diagnostic
// about the whole file shows no line and no column. The file's name may hold any bytes.
std::string HeadLineOf(std::string_view file, const Diagnostic& diagnostic);
std::string HelpLineOf(const Diagnostic& diagnostic);

// Both lines, with line ends.
std::string Render(std::string_view file, const Diagnostic& diagnostic);

}  // namespace diag
