#include "tests/scan/NumberTexts.h"

#include <bit>
#include <charconv>
#include <cmath>

#include "tests/scan/ExactDecimal.h"

namespace scan_tests {
namespace {

constexpr int kSignificandBits = 53;

template <typename... Format>
void Put(double value, std::string* text, Format... format) {
  char digits[1200];
  const auto written = std::to_chars(digits, digits + sizeof digits, value, format...);
  text->append(digits, written.ptr);
}

void PutInteger(std::uint64_t value, std::string* text) {
  char digits[24];
  const auto written = std::to_chars(digits, digits + sizeof digits, value);
  text->append(digits, written.ptr);
}

// 52 bits at random below a leading one.
std::uint64_t Significand(SeededBits* random) {
  constexpr std::uint64_t kLeading = std::uint64_t{1} << (kSignificandBits - 1);
  return (random->Next() & (kLeading - 1)) | kLeading;
}

}  // namespace

const NumberTexts::Form NumberTexts::kTable[kForms] = {
    {"short decimals", 20, &NumberTexts::ShortDecimal},
    {"integers", 10, &NumberTexts::Integer},
    {"shortest form of a baked value", 20, &NumberTexts::BakedValue},
    {"15 to 17 digits of a baked value", 15, &NumberTexts::DigitsAsAsked},
    {"with an exponent", 8, &NumberTexts::Exponent},
    {"any double", 8, &NumberTexts::AnyDouble},
    {"subnormal", 3, &NumberTexts::Subnormal},
    {"at the ends of the range", 3, &NumberTexts::EdgeOfRange},
    {"many digits", 4, &NumberTexts::ManyDigits},
    {"zeros before and after", 3, &NumberTexts::Zeros},
    {"halfway between two doubles, near 1", 3, &NumberTexts::Halfway},
    {"halfway between two doubles, anywhere", 1, &NumberTexts::HalfwayAnywhere},
    {"with a plus or letters after", 2, &NumberTexts::WithSuffix},
};

std::string_view NumberTexts::FormName(int form) { return kTable[form].name; }

int NumberTexts::Append(std::string* text) {
  int left = random_.Pick(0, 99);
  const Form* form = kTable;
  for (; left >= form->share; ++form) left -= form->share;
  (this->*form->write)(text);
  return static_cast<int>(form - kTable);
}

void NumberTexts::Sign(std::string* text) {
  if (random_.Pick(0, 2) == 0) *text += '-';
}

void NumberTexts::Digits(int count, std::string* text) {
  constexpr int kDigitsOfOne = 16;
  while (count > 0) {
    std::uint64_t bits = random_.Next();
    for (int i = 0; i < kDigitsOfOne && count > 0; ++i, --count, bits >>= 4) {
      // Sixteen values for ten digits: 0 and 9, which make carries, come more often.
      constexpr std::string_view kDigits = "0123456789009990";
      *text += kDigits[bits & 15];
    }
  }
}

void NumberTexts::ShortDecimal(std::string* text) {
  Sign(text);
  PutInteger(random_.Next() >> random_.Pick(50, 63), text);
  *text += '.';
  Digits(random_.Pick(1, 8), text);
}

void NumberTexts::Integer(std::string* text) {
  Sign(text);
  PutInteger(random_.Next() >> random_.Pick(0, 63), text);
}

void NumberTexts::BakedValue(std::string* text) {
  const auto significand = static_cast<double>(static_cast<std::int64_t>(random_.Next()) >> 11);
  Put(std::ldexp(significand, random_.Pick(-75, -35)), text);
}

void NumberTexts::DigitsAsAsked(std::string* text) {
  const auto significand = static_cast<double>(static_cast<std::int64_t>(random_.Next()) >> 11);
  const auto form = random_.Pick(0, 1) == 0 ? std::chars_format::general : std::chars_format::fixed;
  Put(std::ldexp(significand, random_.Pick(-75, -35)), text, form, random_.Pick(15, 17));
}

void NumberTexts::Exponent(std::string* text) {
  Sign(text);
  Digits(1, text);
  if (random_.Pick(0, 3) != 0) *text += '.';
  Digits(random_.Pick(0, 18), text);
  *text += random_.Pick(0, 3) == 0 ? 'E' : 'e';
  const int sign = random_.Pick(0, 2);
  if (sign != 0) *text += sign == 1 ? '-' : '+';
  if (random_.Pick(0, 3) == 0) *text += "00";
  const int most = random_.Pick(0, 3) == 0 ? 345 : 40;
  PutInteger(static_cast<std::uint64_t>(random_.Pick(0, most)), text);
}

double NumberTexts::AnyBits() {
  for (;;) {
    const double value = std::bit_cast<double>(random_.Next());
    if (std::isfinite(value)) return value;
  }
}

void NumberTexts::AnyDouble(std::string* text) {
  const double value = AnyBits();
  if (random_.Pick(0, 1) == 0) {
    Put(value, text);
  } else {
    Put(value, text, std::chars_format::scientific, random_.Pick(13, 21));
  }
}

void NumberTexts::Subnormal(std::string* text) {
  const std::uint64_t bits = random_.Next() >> random_.Pick(12, 63);
  Put(std::bit_cast<double>(bits), text, std::chars_format::scientific, random_.Pick(0, 24));
}

// Where overflow and underflow begin, and exponents far beyond.
void NumberTexts::EdgeOfRange(std::string* text) {
  Sign(text);
  if (random_.Pick(0, 3) == 0) {
    const bool largest = random_.Pick(0, 1) == 0;
    *text += largest ? "1.79769313486231" : "4.9406564584124";
    Digits(random_.Pick(0, 9), text);
    *text += largest ? "e308" : "e-324";
    return;
  }
  Digits(random_.Pick(1, 22), text);
  if (random_.Pick(0, 1) == 0) *text += '.';
  Digits(random_.Pick(0, 9), text);
  *text += random_.Pick(0, 1) == 0 ? "e-" : "e";
  const int far = random_.Pick(0, 9);
  PutInteger(
      far == 0 ? random_.Next() >> random_.Pick(0, 50) : static_cast<std::uint64_t>(random_.Pick(285, 350)),
      text);
}

void NumberTexts::ManyDigits(std::string* text) {
  Sign(text);
  const int most = random_.Pick(0, 63) == 0 ? 900 : 45;
  const int digits = random_.Pick(18, most);
  const int whole = random_.Pick(0, digits);
  Digits(whole, text);
  *text += '.';
  Digits(digits - whole, text);
}

void NumberTexts::Zeros(std::string* text) {
  Sign(text);
  text->append(static_cast<std::size_t>(random_.Pick(0, 25)), '0');
  Digits(random_.Pick(0, 3), text);
  *text += '.';
  text->append(static_cast<std::size_t>(random_.Pick(0, 25)), '0');
  Digits(random_.Pick(1, 17), text);
  text->append(static_cast<std::size_t>(random_.Pick(0, 9)), '0');
}

// Leaves a point halfway as it is, or moves it to one side as little as its digits let it.
void NumberTexts::Disturb(std::string* text) {
  const bool fraction = text->find('.') != std::string::npos;
  switch (random_.Pick(0, 4)) {
    case 0:
      if (text->back() != '9') ++text->back();
      break;
    case 1:
      if (text->back() != '0') --text->back();
      break;
    case 2:
      if (!fraction) *text += '.';
      text->append(static_cast<std::size_t>(random_.Pick(0, 30)), '0');
      *text += '1';
      break;
    case 3: {
      const std::size_t kept = static_cast<std::size_t>(random_.Pick(17, 40));
      const std::size_t point = text->find('.');
      if (fraction && kept > point + 1 && kept < text->size()) text->resize(kept);
      break;
    }
    default:
      break;
  }
}

// An integer of 54 to 64 bits, or one divided by a power of two, whose 54th bit is the last that is set.
void NumberTexts::Halfway(std::string* text) {
  const std::uint64_t odd = Significand(&random_) * 2 + 1;
  std::string number;
  if (random_.Pick(0, 1) == 0) {
    PutInteger(odd << random_.Pick(0, 10), &number);
  } else {
    const int bits = random_.Pick(1, 60);
    const std::uint64_t mask = (std::uint64_t{1} << bits) - 1;
    PutInteger(odd >> bits, &number);
    number += '.';
    for (std::uint64_t fraction = odd & mask; fraction != 0; fraction &= mask) {
      fraction *= 10;
      number += static_cast<char>('0' + (fraction >> bits));
    }
  }
  Disturb(&number);
  Sign(text);
  *text += number;
}

void NumberTexts::HalfwayAnywhere(std::string* text) {
  // From the point between 0 and the least subnormal to the one where overflow begins.
  const int exponent = random_.Pick(-1075, 970);
  const std::uint64_t significand =
      exponent == -1075 ? random_.Next() >> random_.Pick(12, 63) : Significand(&random_);
  std::string number = ExactDecimal(significand * 2 + 1, exponent);
  Disturb(&number);
  Sign(text);
  *text += number;
}

void NumberTexts::WithSuffix(std::string* text) {
  constexpr std::string_view kSuffixes[] = {"", "fps", "df", "e", "E", "inf", "nan", "x"};
  if (random_.Pick(0, 1) == 0) *text += '+';
  PutInteger(random_.Next() >> random_.Pick(30, 63), text);
  *text += '.';
  Digits(random_.Pick(0, 17), text);
  *text += kSuffixes[random_.Pick(0, 7)];
}

}  // namespace scan_tests
