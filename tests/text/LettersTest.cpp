#include "text/Letters.h"

#include <gtest/gtest.h>

#include <string_view>

namespace text {
namespace {

TEST(Letters, CapitalsOfAsciiBecomeSmallAndAllElseStays) {
  EXPECT_EQ(Lowered("AbYZ@[`{09_"), "abyz@[`{09_");
  EXPECT_EQ(Lowered("\xc3\x84\xff"), "\xc3\x84\xff");
  EXPECT_EQ(Lowered(std::string_view("A\0B", 3)), std::string_view("a\0b", 3));
}

}  // namespace
}  // namespace text
