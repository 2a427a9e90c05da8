#include "tools/mayascene/TerminalText.h"

#include <gtest/gtest.h>
#include <stdlib.h>
#include <unistd.h>

#include <string>

namespace mayascene {
namespace {

TEST(TerminalText, OrdinaryTextStaysAsItIs) {
  EXPECT_EQ(terminalText("shotcam <b>&amp;</b> \\ \"x\" caf\xc3\xa9 \xe6\x98\xa0 \xf0\x9f\x8e\xa5"),
            "shotcam <b>&amp;</b> \\ \"x\" caf\xc3\xa9 \xe6\x98\xa0 \xf0\x9f\x8e\xa5");
}

TEST(TerminalText, EveryControlCharacterIsEscaped) {
  for (int code = 0; code < 0x20; ++code) {
    const std::string shown = terminalText(std::string(1, static_cast<char>(code)));
    EXPECT_EQ(shown.front(), '\\') << code;
    EXPECT_GE(shown.size(), 2u) << code;
  }
  EXPECT_EQ(terminalText("\x1b[31m\a\b\x7f"), "\\x1b[31m\\x07\\x08\\x7f");
  EXPECT_EQ(terminalText("a\nb\rc\td"), "a\\nb\\rc\\td");
  EXPECT_EQ(terminalText(std::string("a\0b", 3)), "a\\x00b");
}

TEST(TerminalText, ControlsOfTheSecondSetAreEscaped) {
  EXPECT_EQ(terminalText("\xc2\x80|\xc2\x9b"
                         "31m|\xc2\x9f|\xc2\xa0"),
            "\\u0080|\\u009b31m|\\u009f|\xc2\xa0");
}

TEST(TerminalText, CharactersThatTurnTheWritingDirectionAreEscaped) {
  EXPECT_EQ(terminalText("a\xe2\x80\xae"
                         "b"),
            "a\\u202eb");
  EXPECT_EQ(terminalText("\xe2\x81\xa6\xe2\x80\x8b\xef\xbb\xbf\xd8\x9c\xe2\x80\xa8"),
            "\\u2066\\u200b\\ufeff\\u061c\\u2028");
}

TEST(TerminalText, EachByteThatIsNoUtf8IsReplaced) {
  EXPECT_EQ(terminalText("a\xff\xfe"
                         "b"),
            "a\xef\xbf\xbd\xef\xbf\xbd"
            "b");
  EXPECT_EQ(terminalText("\xe6\x98"), "\xef\xbf\xbd\xef\xbf\xbd");  // cut short
  EXPECT_EQ(terminalText("\xc0\xaf"), "\xef\xbf\xbd\xef\xbf\xbd");  // a longer form than needed
}

TEST(TerminalText, QuotesShowAnEmptyName) {
  EXPECT_EQ(quotedTerminalText(""), "\"\"");
  EXPECT_EQ(quotedTerminalText(" a\n"), "\" a\\n\"");
}

TEST(Style, WithoutColourNothingIsAdded) {
  const Style plain(false);
  EXPECT_EQ(plain.strong("a") + plain.faint("b") + plain.alarm("c"), "abc");
}

TEST(Style, ColourIsSwitchedOffAgain) { EXPECT_EQ(Style(true).strong("a"), "\x1b[1ma\x1b[0m"); }

TEST(Style, APipeGetsNoColour) {
  int ends[2];
  ASSERT_EQ(::pipe(ends), 0);
  EXPECT_FALSE(colourAllowed(ends[1]));
  ::close(ends[0]);
  ::close(ends[1]);
}

}  // namespace
}  // namespace mayascene
