// Passes in bulk over what the reader's main loop ignores.
//
// Between commands the loop acts on keywords alone. Most of a scene is numbers, so it need not see every
// token: this finds the next place that it has to look at, 64 bytes at a time.
#pragma once

#include <cstdint>
#include <span>

// From `position`, where a token may start, to the next place where a token starts that is, or may be, more
// than a harmless word: a string, a comment, the first letter of a keyword that the loop acts on (c or s), a
// one-byte token, an illegal byte or a NUL. Harmless are white space, ";" and whole words that begin with
// another letter, a digit, "." or a "-" that begins a number or an option. Adds the line feeds that are
// passed to *lines. May stop earlier, at most 64 bytes or one word before `end`, the text's terminating NUL,
// beyond which it does not read.
//
// There are several, which differ in nothing but speed.
using SkipHarmlessText = const char* (*)(const char* position, const char* end, std::int32_t* lines);

struct HarmlessTextSkipper {
  const char* name;
  SkipHarmlessText skip;

  // The same inside a command whose words do not matter: stops at ";" and at every "-" too.
  SkipHarmlessText skipInCommand;
};

// Those that this processor can run, the fastest last. Never empty; the first one runs on every processor.
std::span<const HarmlessTextSkipper> HarmlessTextSkippers();
