// Skips, in bulk, the words of a scene that the reader ignores.
//
// Between commands the reader acts on keywords alone. Most of a scene is numbers, so it need not see every
// word: this finds the next place that it has to look at, 64 bytes at a time.
#pragma once

#include <cstdint>
#include <span>

namespace scan {

// From `position`, where a word may start, to the next place where one starts that is, or may be, more than a
// harmless word: a string, a comment, the first letter of a keyword that acts between commands (c or s), a
// one-byte token, an illegal byte or a NUL. Harmless are white space, ";" and whole words that begin with
// another letter, a digit, "." or a "-" that begins a number or an option. Adds the line feeds that are
// passed to *lines. May stop earlier, at most 64 bytes or one word before `end`, the text's terminating NUL.
// Reads nothing before `position` and nothing after `end`.
using SkipText = const char* (*)(const char* position, const char* end, std::int32_t* lines);

// The implementations of SkipText give the same results; only their speed differs.
struct TextSkipper {
  const char* name;
  SkipText betweenCommands;

  // The same inside a command whose words do not matter: stops at ";" and at every "-" too.
  SkipText inCommand;
};

// The implementations that this processor can run, the fastest last. Never empty; the first one runs on every
// processor. The table lives as long as the program.
std::span<const TextSkipper> TextSkippers();

}  // namespace scan
