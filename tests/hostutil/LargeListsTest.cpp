// Lists so large that they are made of whole pages of the system.
#include <sys/mman.h>
#include <sys/syscall.h>
#include <unistd.h>

#include <cerrno>
#include <cstdarg>
#include <cstdint>
#include <cstring>
#include <vector>

#include "UtilityTest.h"

namespace {

int refusedMoves = 0;  // so many of the next ones

}  // namespace

// In the place of the system library's, for the whole program, the utility library included.
extern "C" __attribute__((visibility("default"))) void* mremap(void* block, size_t size, size_t newSize,
                                                               int flags, ...) noexcept {
  if (refusedMoves > 0) {
    --refusedMoves;
    errno = ENOMEM;
    return MAP_FAILED;
  }
  va_list rest;
  va_start(rest, flags);
  void* const target = (flags & MREMAP_FIXED) != 0 ? va_arg(rest, void*) : nullptr;
  va_end(rest);
  return reinterpret_cast<void*>(syscall(SYS_mremap, block, size, newSize, flags, target));
}

namespace hostutil_tests {
namespace {

constexpr std::int64_t kMegabyte = std::int64_t{1} << 20;

// A list of five records of a megabyte each, which takes three large pages of two.
class LargeListsTest : public UtilityTest {
 protected:
  void SetUp() override {
    ASSERT_EQ(RecordListCreate(kMegabyte, 1, 0, &list_), HOST_ERR_NONE);
    RecordListReserve(list_, kRecords);
    for (std::int64_t i = 0; i < kRecords; ++i) ASSERT_EQ(Append(i), HOST_ERR_NONE);
    first_ = RecordListPeek(list_, 0);
  }
  void TearDown() override {
    EXPECT_EQ(RecordListDispose(list_), HOST_ERR_NONE);
    UtilityTest::TearDown();
  }

  static std::vector<unsigned char> Record(std::int64_t number) {
    return std::vector<unsigned char>(kMegabyte, static_cast<unsigned char>(number + 1));
  }
  HostError Append(std::int64_t number) { return RecordListAppend(list_, Record(number).data()); }

  void ExpectRecords(std::int64_t count) {
    std::int64_t counted = 0;
    EXPECT_EQ(RecordListCount(list_, &counted), HOST_ERR_NONE);
    EXPECT_EQ(counted, count);
    for (std::int64_t i = 0; i < count; ++i) {
      EXPECT_EQ(std::memcmp(RecordListPeek(list_, i), Record(i).data(), kMegabyte), 0) << i;
    }
  }

  static constexpr std::int64_t kRecords = 5;
  RecordList* list_ = nullptr;
  const void* first_ = nullptr;
};

TEST_F(LargeListsTest, AListGrowsInItsPlaceUpToTheEndOfItsLastPage) {
  RecordListReserve(list_, 1);
  ASSERT_EQ(Append(kRecords), HOST_ERR_NONE);
  EXPECT_EQ(RecordListPeek(list_, 0), first_);
  ExpectRecords(kRecords + 1);
}

TEST_F(LargeListsTest, AListThatGrowsBeyondItTakesItsRecordsAlong) {
  for (std::int64_t i = kRecords; i < 3 * kRecords; ++i) ASSERT_EQ(Append(i), HOST_ERR_NONE);
  ExpectRecords(3 * kRecords);
}

TEST_F(LargeListsTest, AListForWhichThereAreNoAddressesStaysAsItIs) {
  constexpr std::int64_t kBeyondTheAddressSpace = std::int64_t{1} << 42;
  RecordListReserve(list_, kBeyondTheAddressSpace);
  EXPECT_EQ(RecordListAppendRun(list_, first_, kBeyondTheAddressSpace), HOST_ERR_LIST_MEMORY);
  EXPECT_EQ(RecordListPeek(list_, 0), first_);
  ExpectRecords(kRecords);
}

TEST_F(LargeListsTest, NoListTakesTheWholeAddressSpace) {
  RecordList* list = nullptr;
  EXPECT_EQ(RecordListCreate(1, 1, INT64_MAX, &list), HOST_ERR_LIST_MEMORY);
  EXPECT_EQ(list, nullptr);
}

TEST_F(LargeListsTest, AListThatTheSystemDoesNotMoveStaysAsItIs) {
  const std::vector<unsigned char> records(3 * kMegabyte, 9);
  refusedMoves = 1;
  EXPECT_EQ(RecordListAppendRun(list_, records.data(), 3), HOST_ERR_LIST_MEMORY);
  EXPECT_EQ(refusedMoves, 0);
  EXPECT_EQ(RecordListPeek(list_, 0), first_);
  ExpectRecords(kRecords);
  EXPECT_EQ(RecordListAppendRun(list_, records.data(), 3), HOST_ERR_NONE) << "later there is room again";
  EXPECT_EQ(std::memcmp(RecordListPeek(list_, kRecords), records.data(), 3 * kMegabyte), 0);
}

}  // namespace
}  // namespace hostutil_tests
