// A value of a scene: part of the text, converted when a caller asks for it.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "diag/Diagnostic.h"

namespace scene {

// Refers to the scene's text, which must outlive it.
class Value {
 public:
  // `text` stands at `offset` of the file and reaches from the first value to the last. The first `first`
  // numbers are skipped.
  Value(std::string_view text, std::uint64_t offset, std::size_t first = 0)
      : text_(text), offset_(offset), first_(first) {}

  // As it is written.
  std::string_view text() const { return text_; }

  // Its place in the file.
  diag::Range range() const { return {offset_, text_.size()}; }

  // The first number. The words yes, on, true and no, off, false are 1 and 0. None where something else
  // stands, and where the number is too large for a double.
  std::optional<double> Number() const;

  // The numbers up to the first word that is not a number, at most `most`.
  std::vector<double> Numbers(std::size_t most = static_cast<std::size_t>(-1)) const;

  // Whether there is a first number, and it is not 0.
  bool IsOn() const;

  // The first string, with its escapes read; strings that are joined by "+" are one. None where no string
  // stands.
  std::optional<std::string> String() const;

 private:
  std::string_view text_;
  std::uint64_t offset_;
  std::size_t first_;
};

// One word as a number: an optional sign, digits with an optional fraction and exponent. None for anything
// else ("1.#QNAN", "0x10") and for what is too large; what is too small for a double is 0.
std::optional<double> NumberOf(std::string_view word);

}  // namespace scene
