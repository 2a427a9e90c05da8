#include "scan/LineFeeds.h"

#include <gtest/gtest.h>

#include <string_view>

#include "tests/support/GuardedMemory.h"

namespace scan_tests {
namespace {

std::int32_t Count(std::string_view text) {
  return scan::CountLineFeeds(text.data(), text.data() + text.size());
}

TEST(LineFeedsTest, LineFeedsAloneAreCounted) {
  EXPECT_EQ(Count(""), 0);
  EXPECT_EQ(Count("1 2\r3\t4\v5"), 0);
  EXPECT_EQ(Count("\n"), 1);
  EXPECT_EQ(Count("\n\n\n"), 3);
  EXPECT_EQ(Count("1\r\n\t2\n 3"), 2);
  EXPECT_EQ(Count(std::string_view("\0\n\0", 3)), 1);
}

TEST(LineFeedsTest, OnesOutsideAreNotCounted) {
  constexpr std::string_view text = "\n1\n2\n";
  EXPECT_EQ(Count(text.substr(1, 3)), 1);
  EXPECT_EQ(Count(text.substr(1, 1)), 0);
  EXPECT_EQ(Count(text.substr(2, 1)), 1);
}

TEST(LineFeedsTest, NothingAfterTheEndIsRead) {
  testsupport::GuardedMemory room;
  const char* const end = room.Put("1\n2\n", 0) + 1;  // the page after it may not be touched
  EXPECT_EQ(scan::CountLineFeeds(end - 5, end), 2);
}

}  // namespace
}  // namespace scan_tests
