// The parser's lifetime, its main loop, and what every command parser uses. Reads and writes `currentKind`
// and `current`; calls no suite.
#include "maya/MAYA_Parse.h"

#include <cstring>

#include "maya/ListAccess.h"
#include "maya/TokenText.h"
#include "scan/LineFeeds.h"

namespace mayaimport {

MAYA_Parse::MAYA_Parse(const WNBasicSuite* basicSuite, const char* text, const char* end)
    : MAYA_Lex(basicSuite, text, end) {
  ClearCurrent();
}

MAYA_Parse::~MAYA_Parse() {
  DisposeLooseKeys();
  RecordListDispose(cameras);
  RecordListDispose(transforms);
  for (std::int64_t i = 0;; ++i) {
    const auto* curve = static_cast<const MAYA_AnimCurve*>(RecordListPeek(curves, i));
    if (curve == nullptr) break;
    RecordListDispose(curve->keys);
  }
  RecordListDispose(curves);
  RecordListDispose(locators);
}

void MAYA_Parse::Parse() {
  for (;;) {
    const char* first = nullptr;
    const char* last = nullptr;
    SkipHarmless();
    switch (GetNextToken(&first, &last)) {
      case CreateNode:
        ParseCreateNode();
        break;
      case SetAttr:
        ParseSetAttr();
        break;
      case ConnectAttr:
        ParseConnectAttr();
        break;
      case Select:
        ParseSelect();
        break;
      case CurrentUnit:
        ParseCurrentUnit();
        break;
      case EndOfFile:
        return;
      default:
        break;  // Deliberate: a keyword acts wherever it stands, also inside a command that is ignored.
    }
  }
}

void MAYA_Parse::ParseSetAttr() {
  switch (currentKind) {
    case kTransformNode:
      ParseTransformSetAttr();
      break;
    case kCameraNode:
      ParseCameraSetAttr();
      break;
    case kCurveNode:
      ParseAnimSetAttr();
      break;
    case kRenderSettings:
      ParseRenderSetAttr();
      break;
    default:
      break;
  }
}

void MAYA_Parse::ParseParent() {}
void MAYA_Parse::ParseTransformParent() {}
void MAYA_Parse::ParseCameraParent() {}
void MAYA_Parse::ParseLocatorSetAttr() {}

void MAYA_Parse::BuildString(const char* first, const char* last, std::int32_t* length,
                             char (&text)[kNameCapacity]) {
  const std::size_t size = TakenLength(first, last);
  std::memcpy(text, first, size);
  text[size] = '\0';
  *length = static_cast<std::int32_t>(size);
}

void MAYA_Parse::BuildQuote(const char* first, const char* last, std::int32_t* length,
                            char (&text)[kNameCapacity]) {
  const std::size_t size = TakenLength(first, last);
  if (size < kQuoteCount) {
    *length = 0;
    text[0] = '\0';
    return;
  }
  BuildString(first + 1, last - 1, length, text);
  *length = static_cast<std::int32_t>(size);
}

// The next token inside a command. The end of the text is an error there.
MayaToken MAYA_Parse::NextInCommand(const char** first, const char** last) {
  const MayaToken kind = GetNextToken(first, last);
  if (kind == EndOfFile) FailAtEnd();
  return kind;
}

double MAYA_Parse::ScanNumber(const char* first, const char* last) const {
  // The first NUL of a token ends the number by itself.
  double value = 0.0;
  ThrowOnNumberError(HostNumberScan(first, static_cast<std::int64_t>(TakenLength(first, last)), &value),
                     first);
  return value;
}

// Reads the plain numbers that stand here one after another, while there is room for them. Returns how many.
// GetNextToken and ScanNumber would give the same numbers; they read what is left.
std::int64_t MAYA_Parse::ReadPlainNumbers(double* numbers, std::int64_t capacity) {
  constexpr char kCommandEnd = ';';
  std::int64_t count = 0;
  const char* after = position;
  const HostError code = HostNumberScanRun(position, end(), kCommandEnd, numbers, capacity, &count, &after);
  line += scan::CountLineFeeds(position, after);
  tokenStart = position = after;
  if (code != kNoError) {
    SkipWhiteSpace();
    ThrowOnNumberError(code, position);
  }
  return count;
}

void MAYA_Parse::ThrowOnNumberError(HostError code, const char* number) const {
  if (code != kNoError) NoteLine(code, number);
  ThrowOnError(code);
}

// Keys that only `current` holds: a failure kept them from their record, or there is no record to write back
// to.
void MAYA_Parse::DisposeLooseKeys() {
  if (currentKind != kCurveNode) return;
  const auto* record = static_cast<const MAYA_AnimCurve*>(RecordListPeek(curves, currentRecord_));
  if (record == nullptr || record->keys != current.curve.keys) RecordListDispose(current.curve.keys);
}

void MAYA_Parse::ClearCurrent() {
  DisposeLooseKeys();
  currentKind = kNoNode;
  currentRecord_ = kNoIndex;
  std::memset(static_cast<void*>(&current), 0, sizeof current);
}

}  // namespace mayaimport
