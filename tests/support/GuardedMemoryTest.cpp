// The memory that ends the process where a test goes one byte too far: without this, tests that use it could
// not fail.
#include "tests/support/GuardedMemory.h"

#include <gtest/gtest.h>

#include <string>
#include <string_view>

namespace testsupport {
namespace {

// A read that is not left out, although nobody looks at the byte.
void Touch(const char* byte) { (void)*static_cast<const volatile char*>(byte); }

TEST(GuardedMemoryTest, HoldsTheTextAndItsNulsToTheLastByte) {
  GuardedMemory memory;
  const char* const text = memory.Hold("word", 2);
  EXPECT_EQ(std::string_view(text, 6), std::string_view("word\0\0", 6));
  Touch(text + 5);
  EXPECT_DEATH(Touch(text + 6), "");
  EXPECT_DEATH(Touch(text + 5 + GuardedMemory::kForbiddenAfter), "");
}

TEST(GuardedMemoryTest, TheByteAfterTheGapIsForbidden) {
  GuardedMemory memory;
  const char* const nul = memory.Put("word", 3);
  EXPECT_EQ(std::string_view(nul - 4, 4), "word");
  EXPECT_EQ(*nul, '\0');
  Touch(nul + 3);
  EXPECT_DEATH(Touch(nul + 4), "");
}

TEST(GuardedMemoryTest, TheByteBeforeTheFirstOneIsForbidden) {
  GuardedMemory memory;
  const char* const nul = memory.PutFirst("word");
  EXPECT_EQ(std::string_view(nul - 4, 4), "word");
  EXPECT_DEATH(Touch(nul - 5), "");
}

TEST(GuardedMemoryTest, ALongerTextAfterAShortOneHasTheSameEdge) {
  GuardedMemory memory;
  (void)memory.Put("a", 0);
  const std::string text(100'000, 'b');
  const char* const nul = memory.Put(text, 0);
  EXPECT_EQ(std::string_view(nul - text.size(), text.size()), text);
  EXPECT_DEATH(Touch(nul + 1), "");
}

}  // namespace
}  // namespace testsupport
