// Runs the lexer on arbitrary bytes: tokens follow one another within the text, and every bulk skipper gives
// the same result as reading token by token.
#include <cstdint>
#include <vector>

#include "fuzz/Bytes.h"
#include "fuzz/ReaderHost.h"
#include "fuzz/Require.h"
#include "fuzz/Target.h"
#include "hostapi/ErrorCodes.h"
#include "maya/MAYA_Lex.h"
#include "scan/SkipText.h"
#include "tests/support/GuardedMemory.h"

using namespace mayaimport;

namespace {

using fuzz::Require;

// A token that the reader acts on, or the error that reading ended with.
struct Event {
  std::int32_t kind;  // of the token, or the code of the error
  std::int64_t first;
  std::int64_t last;
  std::int32_t line;

  bool operator==(const Event&) const = default;
};

enum class Where { BetweenCommands, InCommand };

// Whether every skipper stops at the token. In a command these are its end, strings, comments and options.
bool Acts(Where where, MayaToken kind) {
  switch (kind) {
    case CreateNode:
    case SetAttr:
    case ConnectAttr:
    case Select:
    case CurrentUnit:
      return where == Where::BetweenCommands;
    case Semicolon:
    case Option:
      return where == Where::InCommand;
    case String:
    case Comment:
    case EndOfFile:
      return true;
    default:
      return false;
  }
}

struct Text {
  const char* begin;
  const char* end;  // the terminating NUL
};

void CheckToken(const Text& text, MayaToken kind, const char* before, const char* first, const char* last) {
  Require(first >= before, "a token begins after the one before it");
  Require(last >= first && last <= text.end, "a token lies within the text");
  Require(last < text.end || kind == EndOfFile, "only the end of the text reaches its NUL");
}

// The end of the text, asked for again, is the same end.
void CheckEnd(MAYA_Lex& lexer, const char* end) {
  for (int i = 0; i < 2; ++i) {
    const char* first = nullptr;
    const char* last = nullptr;
    Require(lexer.GetNextToken(&first, &last) == EndOfFile, "after the end there are no tokens");
    Require(first == end && last == end, "the end of the text does not move");
  }
}

void CheckError(const Text& text, const MAYA_Lex& lexer, int code) {
  Require(code == HOST_ERR_MAYA_SYNTAX || code == HOST_ERR_MAYA_UNEXPECTED_END,
          "an error is a documented one");
  Require(lexer.position >= text.begin && lexer.position <= text.end, "an error is found within the text");
}

// Reads all of the text, with the skipper, where there is one, before each token.
void Read(const Text& text, Where where, scan::SkipText skip, std::vector<Event>* events) {
  events->clear();
  fuzz::ReaderHost host;
  MAYA_Lex lexer(host.basicSuite(), text.begin, text.end);
  const auto offset = [&](const char* at) { return at - text.begin; };
  try {
    for (MayaToken kind = Unknown; kind != EndOfFile;) {
      const char* const before = lexer.position;
      if (skip != nullptr) lexer.tokenStart = lexer.position = skip(before, text.end, &lexer.line);
      Require(lexer.position >= before && lexer.position <= text.end, "a skip stays within the text");
      const char* first = nullptr;
      const char* last = nullptr;
      kind = lexer.GetNextToken(&first, &last);
      CheckToken(text, kind, before, first, last);
      if (Acts(where, kind)) events->push_back({kind, offset(first), offset(last), lexer.line});
      if (kind == EndOfFile) CheckEnd(lexer, first);
    }
    Require(host.messages() == 0, "a text without an error has no message");
  } catch (int code) {
    CheckError(text, lexer, code);
    Require(host.messages() == 1, "an error has one message");
    events->push_back({code, offset(lexer.position), 0, lexer.line});
  }
}

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  static testsupport::GuardedMemory memory;
  static std::vector<Event> plain;
  static std::vector<Event> skipped;
  const char* const begin = memory.Hold(fuzz::TextOf(data, size), 1);
  const Text text{begin, begin + size};
  for (const Where where : {Where::BetweenCommands, Where::InCommand}) {
    Read(text, where, nullptr, &plain);
    for (const scan::TextSkipper& skipper : scan::TextSkippers()) {
      Read(text, where, where == Where::InCommand ? skipper.inCommand : skipper.betweenCommands, &skipped);
      Require(skipped == plain, "skipping text without an effect changes nothing that is found");
    }
  }
  return 0;
}
