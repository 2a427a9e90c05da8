#include "scene/Text.h"

#include <cstddef>

namespace scene {
namespace {

char CharacterOf(char escaped) {
  switch (escaped) {
    case 'n':
      return '\n';
    case 't':
      return '\t';
    case 'r':
      return '\r';
    case 'b':
      return '\b';
    case 'f':
      return '\f';
    default:
      return escaped;
  }
}

}  // namespace

std::string Unescaped(std::string_view text) {
  std::string unescaped;
  unescaped.reserve(text.size());
  for (std::size_t at = 0; at < text.size(); ++at) {
    if (text[at] != '\\' || at + 1 == text.size()) {
      unescaped += text[at];
    } else {
      unescaped += CharacterOf(text[++at]);
    }
  }
  return unescaped;
}

}  // namespace scene
