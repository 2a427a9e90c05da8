#include "export/SafeNames.h"

#include <gtest/gtest.h>

namespace interchange {
namespace {

TEST(SafeNames, StayInTheirFolder) {
  EXPECT_EQ(SafeName("../../etc/passwd", "x"), "_.._etc_passwd");
  EXPECT_EQ(SafeName("..", "x"), "x");
  EXPECT_EQ(SafeName("/", "x"), "_");
  EXPECT_EQ(SafeName("a\\b", "x"), "a_b");
  EXPECT_EQ(SafeName("-rf", "x"), "rf");
  EXPECT_EQ(SafeName(".hidden.", "x"), "hidden");
}

TEST(SafeNames, AreNeverEmptyNorADevice) {
  EXPECT_EQ(SafeName("", "camera"), "camera");
  EXPECT_EQ(SafeName("CON", "x"), "_CON");
  EXPECT_EQ(SafeName("com1.cam", "x"), "_com1.cam");
  EXPECT_EQ(SafeName("com1x", "x"), "com1x");
}

TEST(SafeNames, HoldNoBytesButPlainOnes) {
  EXPECT_EQ(SafeName("a\nb\xff"
                     "c d",
                     "x"),
            "a_b_c_d");
  EXPECT_EQ(SafeName(std::string(5000, 'x'), "x").size(), kLongestSafeName);
}

TEST(UniqueNames, AreNotTheSameInCapitals) {
  UniqueNames names;
  EXPECT_EQ(names.Take("cam"), "cam");
  EXPECT_EQ(names.Take("CAM"), "CAM_2");
  EXPECT_EQ(names.Take("cam_2"), "cam_2_2");
}

}  // namespace
}  // namespace interchange
