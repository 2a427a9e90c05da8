// Gathers text into large pieces on its way to a stream. A number has the fewest digits that give the same
// double back, in any locale.
#pragma once

#include <cstddef>
#include <ostream>
#include <string>
#include <string_view>

namespace interchange {

// A finite number: "1.5", "-0.25", "1e+300"; whole numbers below 2^53 without an exponent, "100000"; "0" for
// either zero.
void AppendNumber(std::string* text, double number);

class TextWriter {
 public:
  // The stream outlives the writer.
  explicit TextWriter(std::ostream* stream) : stream_(*stream) { text_.reserve(kPiece + kPiece / 4); }
  ~TextWriter() { Flush(); }
  TextWriter(const TextWriter&) = delete;
  TextWriter& operator=(const TextWriter&) = delete;

  TextWriter& operator<<(std::string_view text) {
    text_ += text;
    return Passed();
  }
  TextWriter& operator<<(const char* text) { return *this << std::string_view(text); }
  TextWriter& operator<<(char c) {
    text_ += c;
    return Passed();
  }
  TextWriter& operator<<(double number) {
    AppendNumber(&text_, number);
    return Passed();
  }
  TextWriter& operator<<(std::size_t count) {
    text_ += std::to_string(count);
    return Passed();
  }

  void Flush();

 private:
  static constexpr std::size_t kPiece = 1U << 16U;

  TextWriter& Passed() {
    if (text_.size() >= kPiece) Flush();
    return *this;
  }

  std::ostream& stream_;
  std::string text_;
};

}  // namespace interchange
