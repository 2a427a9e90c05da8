#include "export/TextWriter.h"

#include <charconv>

namespace interchange {

void AppendNumber(std::string* text, double number) {
  char digits[32];
  const double unsignedZero = number == 0.0 ? 0.0 : number;
  text->append(digits, std::to_chars(digits, digits + sizeof digits, unsignedZero).ptr);
}

void TextWriter::Flush() {
  stream_.write(text_.data(), static_cast<std::streamsize>(text_.size()));
  text_.clear();
}

}  // namespace interchange
