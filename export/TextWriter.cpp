#include "export/TextWriter.h"

#include <charconv>
#include <cmath>
#include <cstdint>

namespace interchange {
namespace {

constexpr double kLargestWhole = 0x1p53;

}  // namespace

void AppendNumber(std::string* text, double number) {
  char digits[32];
  // Whole numbers have no exponent: readers of frame numbers accept 100000, and not 1e+05.
  const bool whole = std::fabs(number) < kLargestWhole && number == std::trunc(number);
  const std::to_chars_result end =
      whole ? std::to_chars(digits, digits + sizeof digits, static_cast<std::int64_t>(number))
            : std::to_chars(digits, digits + sizeof digits, number);
  text->append(digits, end.ptr);
}

void TextWriter::Flush() {
  stream_.write(text_.data(), static_cast<std::streamsize>(text_.size()));
  text_.clear();
}

}  // namespace interchange
