#include "text/JsonWriter.h"

#include <array>
#include <charconv>
#include <cmath>
#include <string>

#include "text/JsonText.h"

namespace text {
namespace {

std::string Quoted(std::string_view bytes) {
  std::string text;
  text.reserve(bytes.size() + 2);
  AppendJsonText(&text, bytes, JsonForm::Ascii);
  return text;
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
