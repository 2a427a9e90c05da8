#include "scene/Value.h"

#include <charconv>
#include <cmath>
#include <system_error>

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

// Over white space, comments and what lists are written with.
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
  if (word.size() > 1 && word[0] == '+' && word[1] != '-') word.remove_prefix(1);
  if (word.empty() || !(IsByte(word.back(), kDigitByte) || word.back() == '.')) return std::nullopt;
  double value = 0.0;
  const auto [end, error] = std::from_chars(word.data(), word.data() + word.size(), value);
  if (end != word.data() + word.size()) return std::nullopt;
  if (error == std::errc()) return value;
  // Too small or too large: only a negative exponent makes a number too small.
  const std::size_t exponent = word.find_first_of("eE");
  const bool small = error == std::errc::result_out_of_range && exponent != std::string_view::npos &&
                     exponent + 1 < word.size() && word[exponent + 1] == '-';
  if (small) return word[0] == '-' ? -0.0 : 0.0;
  return std::nullopt;
}

std::vector<double> Value::Numbers(std::size_t most) const {
  std::vector<double> numbers;
  Cursor cursor(text_);
  for (std::size_t passed = 0; numbers.size() < most;) {
    SkipBetween(cursor);
    const std::optional<double> number = NumberOrFlag(cursor.TakeWord());
    if (!number) break;
    if (passed < first_) {
      ++passed;
    } else {
      numbers.push_back(*number);
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
