// Counts the words of a text with vector instructions. A word is a run of bytes that are no white space;
// white space is that of isspace in the C locale: blank, tab, line feed, vertical tab, form feed, carriage
// return.
#pragma once

#include <cstddef>
#include <span>

namespace bench {

// Reads the `size` bytes from `text` on, and no others. Uses the best of wordCounters().
std::size_t countWords(const char* text, std::size_t size);

struct WordCounter {
  const char* name;
  std::size_t (*count)(const char* text, std::size_t size);
};

// The counters that this processor can run, the fastest last. The table lives as long as the program.
std::span<const WordCounter> wordCounters();

}  // namespace bench
