#include "tests/secondreader/Natural.h"

#include <gtest/gtest.h>

#include <string>

namespace secondreader {
namespace {

Natural natural(const std::string& digits) {
  Natural number;
  for (const char digit : digits) number.multiplyAndAdd(10, static_cast<std::uint32_t>(digit - '0'));
  return number;
}

bool equal(const Natural& a, const Natural& b) { return a.compare(b) == 0; }

TEST(NaturalTest, NumbersAreComparedByTheirSize) {
  EXPECT_EQ(natural("18446744073709551616").compare(natural("18446744073709551615")), 1);
  EXPECT_EQ(natural("4294967295").compare(natural("4294967296")), -1);
  EXPECT_EQ(natural("4294967296").compare(natural("4294967296")), 0);
  EXPECT_EQ(natural("0").compare(natural("1")), -1);
}

TEST(NaturalTest, ZeroHasNoDigits) {
  EXPECT_TRUE(natural("000").isZero());
  EXPECT_EQ(Natural().bits(), 0u);
  EXPECT_EQ(natural("1").bits(), 1u);
  EXPECT_EQ(natural("4294967295").bits(), 32u);
  EXPECT_EQ(natural("4294967296").bits(), 33u);
}

TEST(NaturalTest, DoublingAndHalvingTakeEachOtherBack) {
  Natural number = natural("5");
  number.doubled(67);
  EXPECT_TRUE(equal(number, natural("737869762948382064640")));
  number.halved(66);
  EXPECT_TRUE(equal(number, natural("10")));
  number.halved(2);
  EXPECT_TRUE(equal(number, natural("2")));
  number.halved(70);
  EXPECT_TRUE(number.isZero());
  number.doubled(70);
  EXPECT_TRUE(number.isZero());
}

TEST(NaturalTest, SubtractingBorrowsFromHigherPlaces) {
  Natural number = natural("18446744073709551616");
  number.subtract(natural("1"));
  EXPECT_TRUE(equal(number, natural("18446744073709551615")));
  number.subtract(natural("18446744073709551615"));
  EXPECT_TRUE(number.isZero());
}

TEST(NaturalTest, DividingLeavesWhatIsOver) {
  Natural number = natural("123456789012345678901234567890");
  EXPECT_EQ(divide(&number, natural("9876543210987654321")), 12499999886u);
  EXPECT_TRUE(equal(number, natural("925925941327160484")));
  EXPECT_EQ(divide(&number, natural("925925941327160485")), 0u);
  EXPECT_EQ(divide(&number, natural("925925941327160484")), 1u);
  EXPECT_TRUE(number.isZero());
  EXPECT_EQ(divide(&number, natural("7")), 0u);
}

}  // namespace
}  // namespace secondreader
