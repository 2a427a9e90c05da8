// Texts of numbers, made cheaply: the forms that scenes hold, and those that are hard to round.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>

#include "tests/support/SplitMix.h"

namespace scan_tests {

// The same numbers from the same seed on every machine.
class SeededBits {
 public:
  explicit SeededBits(std::uint64_t seed) : state_(seed) {}

  std::uint64_t Next() { return testsupport::SplitMix(&state_); }

  // From `least` to `most`.
  int Pick(int least, int most) {
    const auto range = static_cast<std::uint64_t>(most - least) + 1;
    return least + static_cast<int>((Next() >> 32) * range >> 32);
  }

 private:
  std::uint64_t state_;
};

class NumberTexts {
 public:
  static constexpr int kForms = 13;

  explicit NumberTexts(std::uint64_t seed) : random_(seed) {}

  // Appends one number. Returns its form, an index into the names.
  int Append(std::string* text);

  static std::string_view FormName(int form);

 private:
  using Writer = void (NumberTexts::*)(std::string*);
  struct Form {
    std::string_view name;
    int share;  // of 100
    Writer write;
  };
  static const Form kTable[kForms];

  void ShortDecimal(std::string* text);
  void Integer(std::string* text);
  void BakedValue(std::string* text);
  void DigitsAsAsked(std::string* text);
  void Exponent(std::string* text);
  void AnyDouble(std::string* text);
  void Subnormal(std::string* text);
  void EdgeOfRange(std::string* text);
  void ManyDigits(std::string* text);
  void Zeros(std::string* text);
  void Halfway(std::string* text);
  void HalfwayAnywhere(std::string* text);
  void WithSuffix(std::string* text);

  void Sign(std::string* text);
  void Digits(int count, std::string* text);
  void Disturb(std::string* text);
  double AnyBits();

  SeededBits random_;
};

}  // namespace scan_tests
