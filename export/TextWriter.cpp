#include "export/TextWriter.h"

#include <charconv>

namespace interchange {

void AppendNumber(std::string* text, double number) {
  char digits[32];
  if (number == 0.0) number = 0.0;  // without a sign
  text->append(digits, std::to_chars(digits, digits + sizeof digits, number).ptr);
}

void TextWriter::Flush() {
  stream_.write(text_.data(), static_cast<std::streamsize>(text_.size()));
  text_.clear();
}

}  // namespace interchange
