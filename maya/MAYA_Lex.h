// Cuts the text of a scene, held whole in memory, into tokens. Works in place: a token is the address of its
// first and of its last byte.
#pragma once

#include <cstdint>

#include "plugin/Messages.h"
#include "plugin/QZGP_SuiteHandler.h"

namespace mayaimport {

// The kinds of token. The numbers are fixed.
enum MayaToken : std::int32_t {
  Unknown = 0,  // "-" before a byte that is no letter, digit, "-" or "."
  Comment = 1,  // "// ..." or "/* ... */"
  File = 2,     // the keywords, in any case
  Requires = 3,
  CreateNode = 4,
  SetAttr = 5,
  AddAttr = 6,
  Parent = 7,
  ConnectAttr = 8,
  DisconnectAttr = 9,
  Select = 10,
  CurrentUnit = 11,
  Identifier = 12,  // a word that begins with a letter and is no keyword
  Number = 13,      // a word that begins with a digit, "-" or "."; not checked further
  OpenParen = 14,
  CloseParen = 15,
  Plus = 16,
  Option = 17,  // "-" and a letter: a flag such as "-n"
  String = 18,  // quotes included
  Semicolon = 19,
  Colon = 20,
  EndOfFile = 21,  // a NUL where a token would start
};

class MAYA_Lex : public QZGP_SuiteHandler {
 public:
  // The text is NUL-terminated and outlives the lexer. `end` points at its terminating NUL; without it, the
  // first NUL is the end. A null buffer is an empty text.
  MAYA_Lex(const WNBasicSuite* basicSuite, const char* buffer, const char* end = nullptr);

  // Hands out the next token's first and last byte and moves one past it. At the end of the text both are the
  // NUL's address, however often it is called.
  //
  // Throws 1289985 after "Error reading Maya file." at a byte that cannot start a token, and 1289986 after
  // "Unexpected end of maya file." where a string, a comment or a word runs into the end; the position is
  // then where the error was found.
  MayaToken GetNextToken(const char** start, const char** last);

  // Moves over white space (tab, carriage return, line feed, space), counting line feeds, to where the next
  // token starts.
  void SkipWhiteSpace();

  // Skips, in bulk, white space and whole words that the main loop ignores. Stops before everything else, and
  // may stop earlier.
  void SkipHarmless();

  // The same inside a command of which only the end, strings, comments and options matter: stops before
  // those, and before every word that begins with a "-".
  void SkipHarmlessInCommand();

  // The same as SkipWhiteSpace over the bytes of a NUL-terminated set. Returns 0.
  std::int32_t SkipCharacters(const char* set);

  // The scanners of one kind each. Called with `position` on the token's first byte; each leaves it on the
  // token's last byte.
  MayaToken ParseQuote();
  MayaToken ParseComment();
  MayaToken ParseOption();
  MayaToken ParseID();

  // Shows a NUL-terminated message to the user.
  void ReportError(const char* message);

  // Shows "Error reading Maya file." and throws 1289985.
  [[noreturn]] void FailReading();

  // Shows "Unexpected end of maya file." and throws 1289986.
  [[noreturn]] void FailAtEnd();

  const char* buffer;      // the scene text
  const char* tokenStart;  // first byte of the token being read
  const char* position;    // the scan position
  std::int32_t line = 0;   // line feeds passed over as white space

 protected:
  // The terminating NUL.
  const char* end() const { return end_; }

  // Reports to the host at which line of the text a failure of that code was found.
  void NoteLine(std::int32_t code, const char* at) const;

 private:
  void ScanWord();
  void ParseLineComment();
  void ParseBlockComment();

  const char* end_;  // the terminating NUL
};

}  // namespace mayaimport
