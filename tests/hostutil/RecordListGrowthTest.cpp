#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <cstdint>
#include <cstring>
#include <vector>

#include "UtilityTest.h"
#include "hostutil/RecordList.h"

namespace hostutil_tests {
namespace {

class RecordListGrowthTest : public UtilityTest {};

TEST_F(RecordListGrowthTest, TheGrowthStepIsAMinimum) {
  for (const std::int64_t growth : {1, 10, 1000, 100000}) {
    RecordList* list = nullptr;
    ASSERT_EQ(RecordListCreate(16, growth, 0, &list), HOST_ERR_NONE);
    const std::array<double, 2> record{1, 2};
    ASSERT_EQ(RecordListAppend(list, record.data()), HOST_ERR_NONE);
    const void* first = RecordListPeek(list, 0);
    for (std::int64_t i = 1; i < growth; ++i) ASSERT_EQ(RecordListAppend(list, record.data()), HOST_ERR_NONE);
    EXPECT_EQ(RecordListPeek(list, 0), first) << "one step holds " << growth << " records";
    EXPECT_EQ(RecordListDispose(list), HOST_ERR_NONE);
  }
}

TEST_F(RecordListGrowthTest, TheStepIsAMinimumFromAnInitialCountToo) {
  RecordList* list = nullptr;
  ASSERT_EQ(RecordListCreate(1, 5000, 3, &list), HOST_ERR_NONE);
  const char record = 'x';
  ASSERT_EQ(RecordListAppend(list, &record), HOST_ERR_NONE);
  const void* first = RecordListPeek(list, 0);
  for (int i = 4; i < 5003; ++i) ASSERT_EQ(RecordListAppend(list, &record), HOST_ERR_NONE);
  EXPECT_EQ(RecordListPeek(list, 0), first);
  EXPECT_EQ(RecordListDispose(list), HOST_ERR_NONE);
}

TEST_F(RecordListGrowthTest, AMillionAppendsGrowTheListAFewTimesOnly) {
  constexpr int kRecords = 1000000;
  RecordList* list = nullptr;
  RecordList* other = nullptr;  // grows beside it, so that neither can grow where it stands
  ASSERT_EQ(RecordListCreate(16, 10, 0, &list), HOST_ERR_NONE);
  ASSERT_EQ(RecordListCreate(16, 10, 0, &other), HOST_ERR_NONE);
  int moves = 0;
  const void* at = nullptr;
  for (int i = 0; i < kRecords; ++i) {
    const std::array<double, 2> record{static_cast<double>(i), 0.5};
    ASSERT_EQ(RecordListAppend(list, record.data()), HOST_ERR_NONE);
    ASSERT_EQ(RecordListAppend(other, record.data()), HOST_ERR_NONE);
    if (RecordListPeek(list, 0) == at) continue;
    at = RecordListPeek(list, 0);
    ++moves;
  }
  // Doubling from ten: 10 · 2^17 is more than a million.
  EXPECT_LE(moves, 18);
  EXPECT_EQ(static_cast<const double*>(RecordListPeek(list, kRecords - 1))[0], kRecords - 1);
  EXPECT_EQ(RecordListDispose(list), HOST_ERR_NONE);
  EXPECT_EQ(RecordListDispose(other), HOST_ERR_NONE);
}

TEST_F(RecordListGrowthTest, AListOfManyMegabytesKeepsItsRecordsAsItGrows) {
  constexpr std::int64_t kRecords = 5000;
  constexpr std::size_t kSize = 10000;  // 50 MB in all
  RecordList* list = nullptr;
  ASSERT_EQ(RecordListCreate(kSize, 1, 0, &list), HOST_ERR_NONE);
  std::vector<unsigned char> record(kSize);
  for (std::int64_t i = 0; i < kRecords; ++i) {
    std::fill(record.begin(), record.end(), static_cast<unsigned char>(i % 251 + 1));
    ASSERT_EQ(RecordListAppend(list, record.data()), HOST_ERR_NONE);
  }
  for (std::int64_t i = 0; i < kRecords; ++i) {
    ASSERT_EQ(RecordListGet(list, i, record.data()), HOST_ERR_NONE);
    ASSERT_EQ(std::count(record.begin(), record.end(), static_cast<unsigned char>(i % 251 + 1)),
              static_cast<std::ptrdiff_t>(kSize))
        << i;
  }
  EXPECT_EQ(RecordListDispose(list), HOST_ERR_NONE);
}

TEST_F(RecordListGrowthTest, EveryRecordSizeIsKeptByteForByte) {
  for (std::size_t size = 1; size <= 300; ++size) {
    RecordList* list = nullptr;
    ASSERT_EQ(RecordListCreate(static_cast<std::int64_t>(size), 3, 0, &list), HOST_ERR_NONE);
    for (int i = 0; i < 10; ++i) {
      std::vector<unsigned char> record(size);
      for (std::size_t at = 0; at < size; ++at) {
        record[at] = static_cast<unsigned char>(at + static_cast<std::size_t>(i) * 31);
      }
      ASSERT_EQ(RecordListAppend(list, record.data()), HOST_ERR_NONE);
      std::vector<unsigned char> copy(size + 1, 0xEE);
      ASSERT_EQ(RecordListGet(list, i, copy.data()), HOST_ERR_NONE);
      ASSERT_EQ(std::memcmp(copy.data(), record.data(), size), 0);
      ASSERT_EQ(copy[size], 0xEE) << "nothing after the record is written";
    }
    ASSERT_EQ(RecordListDispose(list), HOST_ERR_NONE);
  }
}

TEST_F(RecordListGrowthTest, InitialRecordsAreThereAndZero) {
  RecordList* list = nullptr;
  ASSERT_EQ(RecordListCreate(24, 1, 7, &list), HOST_ERR_NONE);
  std::int64_t count = 0;
  ASSERT_EQ(RecordListCount(list, &count), HOST_ERR_NONE);
  EXPECT_EQ(count, 7);
  for (std::int64_t i = 0; i < 7; ++i) {
    std::array<unsigned char, 24> record;
    record.fill(0xAA);
    ASSERT_EQ(RecordListGet(list, i, record.data()), HOST_ERR_NONE);
    EXPECT_EQ(record, (std::array<unsigned char, 24>{}));
  }
  const std::array<unsigned char, 24> ones = [] {
    std::array<unsigned char, 24> filled;
    filled.fill(1);
    return filled;
  }();
  ASSERT_EQ(RecordListAppend(list, ones.data()), HOST_ERR_NONE);
  EXPECT_EQ(std::memcmp(RecordListPeek(list, 7), ones.data(), 24), 0);
  EXPECT_EQ(RecordListDispose(list), HOST_ERR_NONE);
}

TEST_F(RecordListGrowthTest, SizesOutOfRangeAreRefused) {
  const struct {
    std::int64_t recordSize, growth, initial;
  } cases[] = {
      {0, 10, 0},
      {-1, 10, 0},
      {16, 0, 0},
      {16, -10, 0},
      {16, 10, -1},
      {16, 10, INT64_MAX},
      {INT64_MAX, 1, 2},
      {INT64_MIN, INT64_MIN, INT64_MIN},
      {std::int64_t{1} << 62, 1, 2},
      {2, 10, INT64_MAX / 2 + 1},
  };
  for (const auto& one : cases) {
    auto* list = reinterpret_cast<RecordList*>(1);
    EXPECT_EQ(RecordListCreate(one.recordSize, one.growth, one.initial, &list), HOST_ERR_LIST_MEMORY)
        << one.recordSize << " " << one.growth << " " << one.initial;
    EXPECT_EQ(list, nullptr);
  }
}

TEST_F(RecordListGrowthTest, WithoutTheMemoryForTheInitialRecordsThereIsNoList) {
  RecordList* list = nullptr;
  EXPECT_EQ(RecordListCreate(std::int64_t{1} << 20, 1, std::int64_t{1} << 42, &list), HOST_ERR_LIST_MEMORY);
  EXPECT_EQ(list, nullptr);
  EXPECT_TRUE(Ledger().empty());
}

TEST_F(RecordListGrowthTest, AListThatCannotGrowStaysAsItIs) {
  // The first step overflows the address space, the second only the memory.
  for (const std::int64_t growth : {INT64_MAX, INT64_MAX / 16 + 1, std::int64_t{1} << 57}) {
    RecordList* list = nullptr;
    ASSERT_EQ(RecordListCreate(16, growth, 2, &list), HOST_ERR_NONE);
    const void* first = RecordListPeek(list, 0);
    const std::array<double, 2> record{3, 4};
    EXPECT_EQ(RecordListAppend(list, record.data()), HOST_ERR_LIST_MEMORY) << growth;
    std::int64_t count = 0;
    EXPECT_EQ(RecordListCount(list, &count), HOST_ERR_NONE);
    EXPECT_EQ(count, 2);
    EXPECT_EQ(RecordListPeek(list, 0), first);
    EXPECT_EQ(static_cast<const double*>(RecordListPeek(list, 1))[1], 0.0);
    EXPECT_EQ(RecordListDispose(list), HOST_ERR_NONE);
  }
}

TEST_F(RecordListGrowthTest, ManyListsAreMadeAndDisposedOfInAnyOrder) {
  constexpr std::size_t kLists = 27000;
  std::vector<RecordList*> lists(kLists);
  for (RecordList*& list : lists) ASSERT_EQ(RecordListCreate(16, 10, 0, &list), HOST_ERR_NONE);
  EXPECT_EQ(Ledger().size(), kLists);
  for (std::size_t i = 1; i < kLists; i += 2) ASSERT_EQ(RecordListDispose(lists[i]), HOST_ERR_NONE);
  EXPECT_EQ(Ledger().size(), kLists / 2);
  for (std::size_t i = kLists; i >= 2; i -= 2) {
    ASSERT_EQ(RecordListDispose(lists[i - 2]), HOST_ERR_NONE);
  }
  EXPECT_TRUE(Ledger().empty());
}

}  // namespace
}  // namespace hostutil_tests
