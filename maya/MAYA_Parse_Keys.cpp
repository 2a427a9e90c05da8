// "setAttr" on animation curves: reads time and value pairs into the curve's key list. Writes `current` and
// the curve list; calls no suite.
#include "maya/ListAccess.h"
#include "maya/MAYA_Parse.h"
#include "maya/TokenText.h"
#include "maya/Words.h"

namespace {

// Deliberate: the attribute's name is looked for with its case, anywhere in the text. ".KTV[0]" is no key
// attribute, "curve.ktv[3]" is one, and the index range behind it is not read.
bool NamesKeys(std::string_view text) {
  return text.find(".ktv") != std::string_view::npos || text.find(".keyTimeValue") != std::string_view::npos;
}

}  // namespace

void MAYA_Parse::ParseAnimSetAttr() {
  if (FindKeyAttribute()) ReadKeys();
  WriteBackCurve();
}

// As WriteBack. The record may have held other keys, those of another curve of its name; nobody holds them
// then.
void MAYA_Parse::WriteBackCurve() {
  if (currentRecord_ == kNoIndex) return;
  ChangeRecord<MAYA_AnimCurve>(curves, currentRecord_, [&](MAYA_AnimCurve& target) {
    if (target.keys != current.curve.keys) RecordListDispose(target.keys);
    target = current.curve;
  });
}

// Reads to behind the key attribute. False when the command ends without one.
bool MAYA_Parse::FindKeyAttribute() {
  for (;;) {
    const char* first = nullptr;
    const char* last = nullptr;
    switch (NextInCommand(&first, &last)) {
      case String:
        if (NamesKeys(QuotedText(first, last))) return true;
        break;
      case Option:
        // Deliberate: any other option eats the token behind it, a ";" too; the command then runs on.
        if (!SameWord(WordText(first, last), "-s")) GetNextToken(&first, &last);
        break;
      case Semicolon:
        return false;
      default:
        break;
    }
  }
}

// Reads on to the ";". Every number begins a key; the number behind it is its value, anything else is dropped
// and makes the value 0.
void MAYA_Parse::ReadKeys() {
  for (bool ended = false; !ended;) {
    const char* first = nullptr;
    const char* last = nullptr;
    const MayaToken kind = NextInCommand(&first, &last);
    ended = kind == Semicolon;
    if (kind != Number) continue;
    MAYA_Key key{};
    key.time = ScanNumber(first, last);
    const MayaToken next = NextInCommand(&first, &last);
    if (next == Number) key.value = ScanNumber(first, last);
    ended = next == Semicolon;
    AppendRecord(&current.curve.keys, key);
  }
}
