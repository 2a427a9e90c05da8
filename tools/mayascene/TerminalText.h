// Untrusted text, escaped for a terminal; and the tool's own colours.
#pragma once

#include <string>
#include <string_view>

namespace mayascene {

// For one line of a terminal. Characters that would move the cursor, change colours, break the line or turn
// the writing direction are escaped (\n, \t, \x1b, \u202e); each byte that is not part of valid UTF-8 becomes
// U+FFFD. Everything else stays.
std::string terminalText(std::string_view bytes);

// The same between double quotes, so that an empty name and blanks at the ends can be seen.
std::string quotedTerminalText(std::string_view bytes);

// Whether coloured text may go to the descriptor: it is a terminal, the terminal is not "dumb", and NO_COLOR
// is not in the environment.
bool colourAllowed(int descriptor);

// The few styles in use. Without colour, text passes unchanged.
class Style {
 public:
  explicit Style(bool colour) : colour_(colour) {}

  std::string strong(std::string_view text) const { return wrap("1", text); }
  std::string faint(std::string_view text) const { return wrap("2", text); }
  std::string alarm(std::string_view text) const { return wrap("31", text); }

 private:
  std::string wrap(std::string_view code, std::string_view text) const;

  bool colour_;
};

}  // namespace mayascene
