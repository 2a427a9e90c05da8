// A value as a scene has it: a piece of the text, read when it is asked for.
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
  // `text` is what stands at `offset` of the file, from the first value to the last. Numbers count from
  // `first` on.
  Value(std::string_view text, std::uint64_t offset, std::size_t first = 0)
      : text_(text), offset_(offset), first_(first) {}

  // As it is written.
  std::string_view text() const { return text_; }

  // Where it stands in the file.
  diag::Range range() const { return {offset_, text_.size()}; }

  // The first number. The words yes, on, true and no, off, false are 1 and 0. None where something else
  // stands, and where the number is too large for a double.
  std::optional<double> Number() const;

  // All numbers, at most `most`, up to the first word that is none.
  std::vector<double> Numbers(std::size_t most = static_cast<std::size_t>(-1)) const;

  // Whether Number() is there and not 0.
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
