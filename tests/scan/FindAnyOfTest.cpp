// The next of a few bytes is found where a look at every byte finds it.
#include "scan/FindAnyOf.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <string_view>

#include "tests/support/GuardedMemory.h"

namespace testsupport {
namespace {

// At the edge of what may be read: the NUL after the text is not part of it.
void ExpectTheSamePlaces(const std::string& text) {
  const GuardedText guarded(text.substr(0, text.size() - 1));
  *const_cast<char*>(guarded.end()) = text.back();
  const char* const begin = guarded.begin();
  const char* const end = begin + text.size();
  constexpr std::string_view kWanted = ";\"\n\xff";
  for (const char* at = begin; at != end; ++at) {
    const char* const plain = std::find_first_of(at, end, kWanted.begin(), kWanted.end());
    ASSERT_EQ((scan::FindAnyOf<';', '"', '\n', '\xff'>(at, end)) - begin, plain - begin)
        << text << ' ' << at - begin;
  }
  EXPECT_EQ((scan::FindAnyOf<';', '"'>(end, end)), end);
}

TEST(FindAnyOfTest, EveryByteAtEveryPlaceOfABlock) {
  for (std::size_t size = 1; size <= 40; ++size) {
    ExpectTheSamePlaces(std::string(size, 'x'));
    for (std::size_t at = 0; at < size; ++at) {
      for (const char byte : {';', '"', '\n', '\xff', '\0', ':', '!', '\x0b', '\x7f', '\xfe'}) {
        std::string text(size, 'x');
        text[at] = byte;
        ExpectTheSamePlaces(text);
      }
    }
  }
}

TEST(FindAnyOfTest, OfTwoTheFirstIsFound) {
  for (std::size_t first = 0; first < 33; ++first) {
    for (std::size_t second = first; second < 33; ++second) {
      std::string text(33, ':');
      text[first] = '"';
      text[second] = ';';
      ExpectTheSamePlaces(text);
    }
  }
}

// With every second of the wanted bytes passed over, or all of them, at the edge of what may be read.
void ExpectTheSameStops(const std::string& text) {
  const GuardedText guarded(text.substr(0, text.size() - 1));
  *const_cast<char*>(guarded.end()) = text.back();
  const char* const begin = guarded.begin();
  const char* const end = begin + text.size();
  const auto atOddPlace = [begin](const char* found) { return (found - begin) % 2 == 1; };
  for (const char* at = begin; at != end; ++at) {
    const char* plain = at;
    while (plain != end && ((*plain != ';' && *plain != '\xff') || !atOddPlace(plain))) ++plain;
    ASSERT_EQ((scan::FindAnyOf<';', '\xff'>(at, end, atOddPlace)) - begin, plain - begin)
        << text << ' ' << at - begin;
    ASSERT_EQ((scan::FindAnyOf<';', '\xff'>(at, end, [](const char*) { return false; })), end);
  }
}

TEST(FindAnyOfTest, WhatDoesNotStopIsPassedOver) {
  for (std::size_t size = 1; size <= 140; ++size) {
    ExpectTheSameStops(std::string(size, ';'));
    std::string text(size, 'x');
    for (std::size_t at = 0; at < size; at += 3) text[at] = at % 2 == 0 ? ';' : '\xff';
    ExpectTheSameStops(text);
  }
}

}  // namespace
}  // namespace testsupport
