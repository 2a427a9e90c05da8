#include "tools/mayascene/TerminalText.h"

#include <unistd.h>

#include <cstdlib>

#include "diag/ShownText.h"
#include "text/Utf8.h"

namespace mayascene {

std::string terminalText(std::string_view bytes) { return diag::ShownText(text::ValidUtf8(bytes)); }

std::string quotedTerminalText(std::string_view bytes) { return '"' + terminalText(bytes) + '"'; }

bool colourAllowed(int descriptor) {
  if (std::getenv("NO_COLOR") != nullptr) return false;
  const char* terminal = std::getenv("TERM");
  if (terminal == nullptr || std::string_view(terminal) == "dumb") return false;
  return isatty(descriptor) == 1;
}

std::string Style::wrap(std::string_view code, std::string_view text) const {
  if (!colour_) return std::string(text);
  return "\x1b[" + std::string(code) + 'm' + std::string(text) + "\x1b[0m";
}

}  // namespace mayascene
