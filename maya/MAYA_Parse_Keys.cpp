// "setAttr" on animation curves: reads time and value pairs into the curve's key list. Writes `current` and
// the curve list; calls no suite.
#include <algorithm>
#include <charconv>
#include <cstddef>
#include <cstring>

#include "maya/ListAccess.h"
#include "maya/MAYA_Parse.h"
#include "maya/TokenText.h"
#include "maya/Words.h"

namespace mayaimport {

namespace {

// Deliberate: the attribute's name is looked for with its case, anywhere in the text. ".KTV[0]" is no key
// attribute, "curve.ktv[3]" is one, and the index range after it is not read.
bool NamesKeys(std::string_view text) {
  return text.find(".ktv") != std::string_view::npos || text.find(".keyTimeValue") != std::string_view::npos;
}

// How many more keys to make room for after `read` of them: as many as the command announces, but never more
// than the rest of its own text could hold.
std::int64_t MoreKeys(std::string_view keyCount, std::int64_t read, const char* keys, const char* end) {
  constexpr std::int64_t kShortestKey = 4;  // two digits and two blanks
  const auto* commandEnd =
      static_cast<const char*>(std::memchr(keys, ';', static_cast<std::size_t>(end - keys)));
  const std::int64_t bytesLeft = (commandEnd != nullptr ? commandEnd : end) - keys;
  std::int64_t count = 0;
  std::from_chars(keyCount.data(), keyCount.data() + keyCount.size(), count);
  return std::clamp(std::max(count, read) - read, std::int64_t{0}, bytesLeft / kShortestKey);
}

}  // namespace

void MAYA_Parse::ParseAnimSetAttr() {
  channels_ = NodeChannels();  // a list that grows moves its keys
  std::string_view keyCount;
  if (FindKeyAttribute(&keyCount)) ReadKeys(keyCount);
  WriteBackCurve();
}

// As WriteBack. The record may have held other keys, those of another curve of its name: they are disposed
// of.
void MAYA_Parse::WriteBackCurve() {
  if (currentRecord_ == kNoIndex) return;
  ChangeRecord<MAYA_AnimCurve>(curves, currentRecord_, [&](MAYA_AnimCurve& target) {
    if (target.keys != current.curve.keys) RecordListDispose(target.keys);
    target = current.curve;
  });
}

// Reads to after the key attribute. Hands out the last number before it, as a rule the key count. Numbers
// after another attribute are skipped; the count is then unknown, which only means that no room is made
// ahead. False when the command ends without a key attribute.
bool MAYA_Parse::FindKeyAttribute(std::string_view* lastNumber) {
  bool otherAttribute = false;
  for (;;) {
    const char* first = nullptr;
    const char* last = nullptr;
    if (otherAttribute) SkipHarmlessInCommand();
    switch (NextInCommand(&first, &last)) {
      case String:
        if (NamesKeys(QuotedText(first, last))) return true;
        otherAttribute = true;
        break;
      case Option:
        // Deliberate: any other option eats the token after it, a ";" too; the command then runs on.
        if (!SameWord(WordText(first, last), "-s")) GetNextToken(&first, &last);
        break;
      case Number:
        *lastNumber = WordText(first, last);
        break;
      case Semicolon:
        return false;
      default:
        break;
    }
  }
}

// Reads on to the ";". Every number begins a key; the number after it is its value, anything else is dropped
// and makes the value 0.
void MAYA_Parse::ReadKeys(std::string_view keyCount) {
  for (bool ended = false; !ended;) {
    MAYA_Key key{};
    const char* first = nullptr;
    const char* last = nullptr;
    if (!ReadPlainKeys(keyCount, &key.time)) {
      const MayaToken kind = NextInCommand(&first, &last);
      ended = kind == Semicolon;
      if (kind != Number) continue;
      key.time = ScanNumber(first, last);
    }
    const MayaToken next = NextInCommand(&first, &last);
    if (next == Number) key.value = ScanNumber(first, last);
    ended = next == Semicolon;
    AppendKeys(&key, 1, 1);
  }
}

// Reads the keys that stand here as plain numbers, many at a time; the caller reads the rest token by token.
// True when a time is left over whose value is not a plain number. Most curves end within the first run, so
// only after a full run the text is searched for the end of the command.
bool MAYA_Parse::ReadPlainKeys(std::string_view keyCount, double* time) {
  constexpr std::int64_t kRun = 256;
  static_assert(sizeof(MAYA_Key) == 2 * sizeof(double) && offsetof(MAYA_Key, time) == 0 &&
                offsetof(MAYA_Key, value) == sizeof(double));
  double numbers[2 * kRun];
  std::int64_t read = 2 * kRun;
  while (read == 2 * kRun) {
    read = ReadPlainNumbers(numbers, 2 * kRun);
    const std::int64_t count = read / 2;
    std::int64_t room = count;
    if (count == kRun && current.curve.keys == nullptr) room += MoreKeys(keyCount, kRun, position, end());
    if (count > 0) AppendKeys(numbers, count, room);
  }
  if (read % 2 == 0) return false;
  *time = numbers[read - 1];
  return true;
}

// Appends `count` records of MAYA_Key to the current curve. Its list is made on first use, with room for
// `room` keys.
void MAYA_Parse::AppendKeys(const void* keys, std::int64_t count, std::int64_t room) {
  RecordList** const list = &current.curve.keys;
  if (*list == nullptr) {
    MakeList<MAYA_Key>(list);
    RecordListReserve(*list, room);
  }
  ThrowOnError(RecordListAppendRun(*list, keys, count));
}

}  // namespace mayaimport
