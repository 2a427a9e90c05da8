#include "text/Letters.h"

namespace text {

std::string Lowered(std::string_view bytes) {
  std::string lowered(bytes);
  for (char& c : lowered) {
    if (c >= 'A' && c <= 'Z') c = static_cast<char>(c - 'A' + 'a');
  }
  return lowered;
}

}  // namespace text
