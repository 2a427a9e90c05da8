#include "text/JsonWriter.h"

#include <array>
#include <charconv>
#include <cmath>
#include <string>

#include "text/Utf8.h"

namespace text {
namespace {

void AppendUnit(std::string* text, unsigned unit) {
  constexpr char kDigits[] = "0123456789abcdef";
  *text += "\\u";
  for (const unsigned shift : {12u, 8u, 4u, 0u}) *text += kDigits[(unit >> shift) & 0xfu];
}

void AppendCharacter(std::string* text, char32_t point) {
  constexpr char32_t kFirstOfPairs = 0x10000;
  constexpr std::string_view kShort = "\b\t\n\f\r\"\\";
  constexpr std::string_view kLetters = "btnfr\"\\";
  const std::size_t place = point < 0x80 ? kShort.find(static_cast<char>(point)) : std::string_view::npos;
  if (place != std::string_view::npos) {
    *text += '\\';
    *text += kLetters[place];
  } else if (point >= 0x20 && point < 0x7f) {
    *text += static_cast<char>(point);
  } else if (point < kFirstOfPairs) {
    AppendUnit(text, point);
  } else {
    AppendUnit(text, 0xd800u + ((point - kFirstOfPairs) >> 10));
    AppendUnit(text, 0xdc00u + ((point - kFirstOfPairs) & 0x3ffu));
  }
}

// Writes ASCII only, and everything else as \uXXXX: so a name cannot control a terminal that shows the JSON.
std::string Quoted(std::string_view bytes) {
  constexpr char32_t kReplacement = 0xfffd;
  std::string text = "\"";
  text.reserve(bytes.size() + 2);
  for (std::size_t at = 0; at < bytes.size();) {
    const Character character = CharacterAt(bytes, at);
    AppendCharacter(&text, character.length == 0 ? kReplacement : character.point);
    at += character.length == 0 ? 1 : character.length;
  }
  return text += '"';
}

}  // namespace

void JsonWriter::key(std::string_view name) {
  separate();
  out_ << Quoted(name) << ": ";
  afterKey_ = true;
}

void JsonWriter::text(std::string_view bytes) {
  separate();
  out_ << Quoted(bytes);
}

void JsonWriter::number(double value) {
  if (!std::isfinite(value)) return text(std::isnan(value) ? "nan" : value > 0 ? "inf" : "-inf");
  // Readers take "-0" for the integer 0, which has no sign.
  if (value == 0.0 && std::signbit(value)) return literal("-0.0");
  separate();
  std::array<char, 32> digits{};
  const std::to_chars_result end = std::to_chars(digits.data(), digits.data() + digits.size(), value);
  out_.write(digits.data(), end.ptr - digits.data());
}

void JsonWriter::integer(std::int64_t value) {
  separate();
  out_ << value;
}

void JsonWriter::boolean(bool value) { literal(value ? "true" : "false"); }

void JsonWriter::null() { literal("null"); }

// Every line feed in the value is layout: inside a text it is escaped.
void JsonWriter::written(std::string_view value) {
  separate();
  while (value.ends_with('\n')) value.remove_suffix(1);
  for (std::size_t end = value.find('\n'); end != std::string_view::npos; end = value.find('\n')) {
    out_ << value.substr(0, end);
    newLine();
    value.remove_prefix(end + 1);
  }
  out_ << value;
}

void JsonWriter::literal(std::string_view word) {
  separate();
  out_ << word;
}

void JsonWriter::begin(char bracket, bool oneLine) {
  separate();
  const bool within = !levels_.empty() && levels_.back().oneLine;
  levels_.push_back({oneLine || within, true});
  out_ << bracket;
}

void JsonWriter::end(char bracket) {
  const Level level = levels_.back();
  levels_.pop_back();
  if (!level.oneLine && !level.empty) newLine();
  out_ << bracket;
  if (levels_.empty()) out_ << '\n';
}

void JsonWriter::separate() {
  if (afterKey_) {
    afterKey_ = false;
    return;
  }
  if (levels_.empty()) return;
  Level& level = levels_.back();
  if (!level.empty) out_ << (level.oneLine ? ", " : ",");
  level.empty = false;
  if (!level.oneLine) newLine();
}

void JsonWriter::newLine() {
  out_ << '\n';
  for (std::size_t i = 0; i < levels_.size(); ++i) out_ << ' ';
}

}  // namespace text
