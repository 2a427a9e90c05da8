#include "scene/Value.h"

#include "scan/Decimal.h"
#include "scene/ByteClasses.h"
#include "scene/Cursor.h"
#include "scene/Text.h"

namespace scene {
namespace {

std::optional<double> NumberOrFlag(std::string_view word) {
  if (!word.empty() && IsByte(word[0], kLetterByte)) {
    if (word == "yes" || word == "on" || word == "true") return 1.0;
    if (word == "no" || word == "off" || word == "false") return 0.0;
    return std::nullopt;
  }
  return NumberOf(word);
}

// Skips white space, comments, and the brackets and commas of lists.
void SkipBetween(Cursor& cursor) {
  for (;;) {
    std::uint32_t openComment = 0;
    cursor.SkipBlank(&openComment);
    if (cursor.atEnd() || !IsByte(cursor.Peek(), kPunctuationByte | kBraceByte)) return;
    cursor.Advance(1);
  }
}

}  // namespace

std::optional<double> NumberOf(std::string_view word) {
  // A number with letters after it is not accepted: units in a scene are separate words.
  if (word.empty() || !(IsByte(word.back(), kDigitByte) || word.back() == '.')) return std::nullopt;
  double value = 0.0;
  const auto status = scan::ReadNumber(word.data(), static_cast<std::int64_t>(word.size()), &value);
  return status == scan::NumberStatus::Ok ? std::optional<double>(value) : std::nullopt;
}

std::vector<double> Value::Numbers(std::size_t most) const {
  std::vector<double> numbers;
  Cursor cursor(text_);
  // A number before the last white space ends within the text, so it can be read without a check for the end.
  const std::size_t lastSpace = text_.find_last_of(" \t\n\r");
  const char* const sure = text_.data() + (lastSpace == std::string_view::npos ? 0 : lastSpace);
  for (std::size_t passed = 0; numbers.size() < most;) {
    SkipBetween(cursor);
    const char* const at = cursor.rest().data();
    double value = 0.0;
    const char* const after = at < sure ? scan::ReadPlainNumber(at, sure, ' ', &value) : nullptr;
    if (after != nullptr) {
      cursor.Advance(static_cast<std::size_t>(after - at));
    } else {
      const std::optional<double> number = NumberOrFlag(cursor.TakeWord());
      if (!number) break;
      value = *number;
    }
    if (passed < first_) {
      ++passed;
    } else {
      numbers.push_back(value);
    }
  }
  return numbers;
}

std::optional<double> Value::Number() const {
  const std::vector<double> numbers = Numbers(1);
  return numbers.empty() ? std::nullopt : std::optional<double>(numbers[0]);
}

bool Value::IsOn() const { return Number().value_or(0.0) != 0.0; }

std::optional<std::string> Value::String() const {
  std::optional<std::string> joined;
  Cursor cursor(text_);
  for (;;) {
    SkipBetween(cursor);
    if (joined) {
      if (cursor.Peek() != '+') return joined;
      cursor.Advance(1);
      SkipBetween(cursor);
    }
    if (cursor.atEnd() || cursor.Peek() != '"') return joined;
    bool closed = false;
    bool escaped = false;
    const std::string_view inside = cursor.TakeString(&closed, &escaped);
    if (!joined) joined.emplace();
    *joined += escaped ? Unescaped(inside) : std::string(inside);
  }
}

}  // namespace scene
