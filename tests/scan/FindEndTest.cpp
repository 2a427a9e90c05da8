// The ends of words and strings are found where a look at every byte finds them.
#include "scan/FindEnd.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <string>
#include <string_view>

#include "tests/scan/HostileTexts.h"
#include "tests/support/GuardedMemory.h"

namespace testsupport {
namespace {

const char* PlainWordEnd(const char* at) {
  while (std::string_view(" \t\r\n;\0", 6).find(*at) == std::string_view::npos) ++at;
  return at;
}

const char* PlainQuote(const char* at) {
  while (*at != '"' && *at != '\0') ++at;
  return at;
}

class FindEndTest : public ::testing::Test {
 protected:
  // From every byte on, with so many bytes after the NUL that may be read.
  void ExpectTheSameEnds(std::string_view text, std::size_t gap) {
    const char* const end = room_.Put(text, gap);
    for (const char* at = end - text.size(); at <= end; ++at) {
      const auto place = at - (end - text.size());
      ASSERT_EQ(scan::FindWordEnd(at, end) - at, PlainWordEnd(at) - at)
          << ::testing::PrintToString(std::string(text)) << " from " << place;
      ASSERT_EQ(scan::FindQuote(at, end) - at, PlainQuote(at) - at)
          << ::testing::PrintToString(std::string(text)) << " from " << place;
    }
  }

  GuardedMemory room_;
};

TEST_F(FindEndTest, EveryPairOfNeighboursIsDistinguished) {
  for (int first = 0; first < 256; ++first) {
    for (int second = 0; second < 256; ++second) {
      std::string text(10, 'w');
      text[3] = static_cast<char>(first);
      text[4] = static_cast<char>(second);
      ExpectTheSameEnds(text, 0);
    }
  }
}

TEST_F(FindEndTest, EveryByteIsFoundAtEveryPlace) {
  for (int byte = 0; byte < 256; ++byte) {
    for (std::size_t place = 0; place < 24; ++place) {
      std::string text(24, 'w');
      text[place] = static_cast<char>(byte);
      ExpectTheSameEnds(text, place % 9);
    }
  }
}

TEST_F(FindEndTest, RandomHostileTextsEndAlike) {
  constexpr int kTexts = 20'000;
  HostileTexts texts(20261121);
  for (int i = 0; i < kTexts; ++i) {
    const std::string_view text = texts.Next();
    ExpectTheSameEnds(text, static_cast<std::size_t>(texts.Pick(0, 9)));
  }
}

}  // namespace
}  // namespace testsupport
