// How many words a text has, as fast as the processor's vector registers give it. A word is a run of bytes
// that are no white space; white space is what isspace of the C locale names: blank, tab, line feed, vertical
// tab, form feed, carriage return.
#pragma once

#include <cstddef>
#include <span>

namespace bench {

// Reads `size` bytes from `text` on, and nothing beside them. Uses the best of WordCounters.
std::size_t CountWords(const char* text, std::size_t size);

struct WordCounter {
  const char* name;
  std::size_t (*count)(const char* text, std::size_t size);
};

// Those that this processor can run, the best one last.
std::span<const WordCounter> WordCounters();

}  // namespace bench
