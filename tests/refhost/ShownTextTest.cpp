#include "refhost/ShownText.h"

#include <gtest/gtest.h>

namespace refhost {
namespace {

struct Case {
  const char* name;
  std::string bytes;
  std::string shown;
};

const std::string kFffd = "\xEF\xBF\xBD";

const Case kCases[] = {
    {"plain", "rig", "rig"},
    {"two bytes", "\xC3\xA9", "\xC3\xA9"},
    {"three bytes", "\xE2\x82\xAC", "\xE2\x82\xAC"},
    {"four bytes", "\xF0\x9F\x8E\xA5", "\xF0\x9F\x8E\xA5"},
    {"last scalar", "\xF4\x8F\xBF\xBF", "\xF4\x8F\xBF\xBF"},
    {"lone continuation", "a\x80z", "a" + kFffd + "z"},
    {"cut sequence", "\xE2\x82z", kFffd + kFffd + "z"},
    {"cut at the end", "\xF0\x9F\x8E", kFffd + kFffd + kFffd},
    {"overlong slash", "\xC0\xAF", kFffd + kFffd},
    {"overlong three bytes", "\xE0\x9F\xBF", kFffd + kFffd + kFffd},
    {"overlong four bytes", "\xF0\x8F\xBF\xBF", kFffd + kFffd + kFffd + kFffd},
    {"surrogate", "\xED\xA0\x80", kFffd + kFffd + kFffd},
    {"beyond the last scalar", "\xF4\x90\x80\x80", kFffd + kFffd + kFffd + kFffd},
    {"never in UTF-8", "\xFF\xFE", kFffd + kFffd},
};

TEST(ShownText, EachByteThatIsNotValidUtf8IsReplaced) {
  for (const Case& c : kCases) {
    EXPECT_EQ(shownText(c.bytes), c.shown) << c.name;
  }
}

TEST(ShownText, LoneSurrogatesOfUnitsAreReplaced) {
  const HostUTF16Unit units[] = {'a', 0xDC80, 0xD83C, 0xDFA5, 0xD800, 'z', 0};
  EXPECT_EQ(shownUnits(units), "a" + kFffd + "\xF0\x9F\x8E\xA5" + kFffd + "z");
}

}  // namespace
}  // namespace refhost
