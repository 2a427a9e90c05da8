#include "hostutil/RecordList.h"

#include <gtest/gtest.h>

#include <array>
#include <cstdint>

#include "UtilityTest.h"

namespace hostutil_tests {
namespace {

struct Record {
  double time;
  double value;
};

class RecordListTest : public UtilityTest {
 protected:
  void SetUp() override { ASSERT_EQ(RecordListCreate(sizeof(Record), 10, 0, &list_), HOST_ERR_NONE); }
  void TearDown() override {
    EXPECT_EQ(RecordListDispose(list_), HOST_ERR_NONE);
    UtilityTest::TearDown();
  }

  void Fill(int count) {
    for (int i = 0; i < count; ++i) {
      const Record record{static_cast<double>(i), -static_cast<double>(i) / 4};
      ASSERT_EQ(RecordListAppend(list_, &record), HOST_ERR_NONE);
    }
  }

  std::int64_t Count() const {
    std::int64_t count = -1;
    EXPECT_EQ(RecordListCount(list_, &count), HOST_ERR_NONE);
    return count;
  }

  RecordList* list_ = nullptr;
};

TEST_F(RecordListTest, ANewListIsEmpty) {
  EXPECT_EQ(Count(), 0);
  Record record{};
  EXPECT_EQ(RecordListGet(list_, 0, &record), HOST_ERR_LIST_INDEX);
}

TEST_F(RecordListTest, RecordsStandInTheOrderOfTheirAppends) {
  Fill(1000);
  EXPECT_EQ(Count(), 1000);
  for (int i = 0; i < 1000; ++i) {
    Record record{-1, -1};
    ASSERT_EQ(RecordListGet(list_, i, &record), HOST_ERR_NONE);
    EXPECT_EQ(record.time, i);
    EXPECT_EQ(record.value, -static_cast<double>(i) / 4);
  }
}

TEST_F(RecordListTest, AppendCopiesTheRecord) {
  Record record{1, 2};
  ASSERT_EQ(RecordListAppend(list_, &record), HOST_ERR_NONE);
  record = {3, 4};
  Record held{};
  ASSERT_EQ(RecordListGet(list_, 0, &held), HOST_ERR_NONE);
  EXPECT_EQ(held.time, 1);
  EXPECT_EQ(held.value, 2);
}

TEST_F(RecordListTest, GetCopiesTheRecordOut) {
  Fill(1);
  Record copy{};
  ASSERT_EQ(RecordListGet(list_, 0, &copy), HOST_ERR_NONE);
  copy.time = 99;
  Record held{};
  ASSERT_EQ(RecordListGet(list_, 0, &held), HOST_ERR_NONE);
  EXPECT_EQ(held.time, 0);
}

TEST_F(RecordListTest, AnIndexOutsideTheListIsRefusedAndTheRecordStaysAsItIs) {
  Fill(3);
  for (const std::int64_t index :
       {std::int64_t{3}, std::int64_t{-1}, INT64_MAX, INT64_MIN, std::int64_t{1} << 32}) {
    Record record{5, 6};
    EXPECT_EQ(RecordListGet(list_, index, &record), HOST_ERR_LIST_INDEX) << index;
    EXPECT_EQ(record.time, 5);
    EXPECT_EQ(record.value, 6);
    void* address = &record;
    EXPECT_EQ(RecordListLock(list_, index, &address), HOST_ERR_LIST_INDEX) << index;
    EXPECT_EQ(address, nullptr);
    EXPECT_EQ(RecordListUnlock(list_, index), HOST_ERR_LIST_INDEX) << index;
    EXPECT_EQ(RecordListPeek(list_, index), nullptr) << index;
  }
}

TEST_F(RecordListTest, AnIndexAfterTheCountButWithinTheMemoryIsRefused) {
  Fill(1);  // the growth step has made room for ten
  Record record{};
  EXPECT_EQ(RecordListGet(list_, 1, &record), HOST_ERR_LIST_INDEX);
}

TEST_F(RecordListTest, WhatIsWrittenThroughALockIsInTheList) {
  Fill(4);
  void* address = nullptr;
  ASSERT_EQ(RecordListLock(list_, 2, &address), HOST_ERR_NONE);
  static_cast<Record*>(address)->value = 77;
  ASSERT_EQ(RecordListUnlock(list_, 2), HOST_ERR_NONE);
  Record record{};
  ASSERT_EQ(RecordListGet(list_, 2, &record), HOST_ERR_NONE);
  EXPECT_EQ(record.time, 2);
  EXPECT_EQ(record.value, 77);
}

TEST_F(RecordListTest, TheAddressOfALockedRecordIsThatOfTheRunThatFollows) {
  Fill(25);
  void* address = nullptr;
  ASSERT_EQ(RecordListLock(list_, 5, &address), HOST_ERR_NONE);
  const auto* run = static_cast<const Record*>(address);
  for (int i = 0; i < 20; ++i) EXPECT_EQ(run[i].time, 5 + i);
  EXPECT_EQ(RecordListUnlock(list_, 5), HOST_ERR_NONE);
}

TEST_F(RecordListTest, NoListGrowsWhileARecordIsLocked) {
  Fill(2);
  void* address = nullptr;
  ASSERT_EQ(RecordListLock(list_, 0, &address), HOST_ERR_NONE);
  const Record record{8, 9};
  EXPECT_EQ(RecordListAppend(list_, &record), HOST_ERR_LIST_LOCKED);
  EXPECT_EQ(Count(), 2);
  EXPECT_EQ(RecordListPeek(list_, 0), address);
  ASSERT_EQ(RecordListUnlock(list_, 0), HOST_ERR_NONE);
  EXPECT_EQ(RecordListAppend(list_, &record), HOST_ERR_NONE);
  EXPECT_EQ(Count(), 3);
}

TEST_F(RecordListTest, LocksNestAndTheAddressStays) {
  Fill(3);
  void* first = nullptr;
  void* second = nullptr;
  ASSERT_EQ(RecordListLock(list_, 1, &first), HOST_ERR_NONE);
  ASSERT_EQ(RecordListLock(list_, 1, &second), HOST_ERR_NONE);
  EXPECT_EQ(first, second);
  ASSERT_EQ(RecordListUnlock(list_, 1), HOST_ERR_NONE);
  const Record record{8, 9};
  EXPECT_EQ(RecordListAppend(list_, &record), HOST_ERR_LIST_LOCKED);
  ASSERT_EQ(RecordListUnlock(list_, 1), HOST_ERR_NONE);
  EXPECT_EQ(RecordListUnlock(list_, 1), HOST_ERR_LIST_INDEX);
  EXPECT_EQ(RecordListAppend(list_, &record), HOST_ERR_NONE);
}

TEST_F(RecordListTest, SeveralRecordsCanBeLockedAndAreUnlockedInAnyOrder) {
  Fill(6);
  std::array<void*, 6> addresses{};
  for (const std::int64_t index : {4, 1, 4, 2, 2, 0}) {
    ASSERT_EQ(RecordListLock(list_, index, &addresses[static_cast<std::size_t>(index)]), HOST_ERR_NONE);
  }
  EXPECT_EQ(static_cast<Record*>(addresses[4]) - static_cast<Record*>(addresses[1]), 3);
  EXPECT_EQ(RecordListUnlock(list_, 3), HOST_ERR_LIST_INDEX) << "not locked";
  const Record record{8, 9};
  for (const std::int64_t index : {4, 2, 0, 4, 1, 2}) {
    EXPECT_EQ(RecordListAppend(list_, &record), HOST_ERR_LIST_LOCKED);
    EXPECT_EQ(RecordListUnlock(list_, index), HOST_ERR_NONE) << index;
  }
  for (const std::int64_t index : {0, 1, 2, 3, 4, 5}) {
    EXPECT_EQ(RecordListUnlock(list_, index), HOST_ERR_LIST_INDEX);
  }
  EXPECT_EQ(RecordListAppend(list_, &record), HOST_ERR_NONE);
}

TEST_F(RecordListTest, ARecordLockedFirstAndAgainLaterCountsItsLocks) {
  Fill(6);
  void* address = nullptr;
  ASSERT_EQ(RecordListLock(list_, 5, &address), HOST_ERR_NONE);
  ASSERT_EQ(RecordListLock(list_, 3, &address), HOST_ERR_NONE);
  ASSERT_EQ(RecordListUnlock(list_, 5), HOST_ERR_NONE);
  ASSERT_EQ(RecordListLock(list_, 3, &address), HOST_ERR_NONE);
  EXPECT_EQ(RecordListUnlock(list_, 3), HOST_ERR_NONE);
  EXPECT_EQ(RecordListUnlock(list_, 3), HOST_ERR_NONE);
  EXPECT_EQ(RecordListUnlock(list_, 3), HOST_ERR_LIST_INDEX);
}

TEST_F(RecordListTest, PeekReadsWithoutALock) {
  Fill(12);
  const auto* record = static_cast<const Record*>(RecordListPeek(list_, 11));
  ASSERT_NE(record, nullptr);
  EXPECT_EQ(record->time, 11);
  EXPECT_EQ(RecordListUnlock(list_, 11), HOST_ERR_LIST_INDEX);
  const Record more{8, 9};
  EXPECT_EQ(RecordListAppend(list_, &more), HOST_ERR_NONE);
}

TEST_F(RecordListTest, PeekOfANullListIsNull) { EXPECT_EQ(RecordListPeek(nullptr, 0), nullptr); }

TEST_F(RecordListTest, ALockedListCanBeRead) {
  Fill(2);
  void* address = nullptr;
  ASSERT_EQ(RecordListLock(list_, 0, &address), HOST_ERR_NONE);
  Record record{};
  EXPECT_EQ(RecordListGet(list_, 1, &record), HOST_ERR_NONE);
  EXPECT_EQ(record.time, 1);
  EXPECT_EQ(RecordListUnlock(list_, 0), HOST_ERR_NONE);
}

TEST_F(RecordListTest, NullPointersAreRefused) {
  Fill(1);
  Record record{};
  void* address = &record;
  std::int64_t count = 9;
  EXPECT_EQ(RecordListCreate(8, 10, 0, nullptr), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(RecordListAppend(nullptr, &record), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(RecordListAppend(list_, nullptr), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(RecordListGet(nullptr, 0, &record), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(RecordListGet(list_, 0, nullptr), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(RecordListLock(nullptr, 0, &address), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(address, nullptr);
  EXPECT_EQ(RecordListLock(list_, 0, nullptr), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(RecordListUnlock(nullptr, 0), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(RecordListCount(nullptr, &count), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(count, 0);
  EXPECT_EQ(RecordListCount(list_, nullptr), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(RecordListDispose(nullptr), HOST_ERR_NONE);
  EXPECT_EQ(Count(), 1);
  EXPECT_EQ(RecordListUnlock(list_, 0), HOST_ERR_LIST_INDEX) << "no lock was taken";
}

TEST_F(RecordListTest, AnObjectThatIsNoListIsRefused) {
  alignas(16) std::array<unsigned char, 512> memory{};
  auto* const other = reinterpret_cast<RecordList*>(memory.data());
  Record record{};
  void* address = nullptr;
  std::int64_t count = 0;
  EXPECT_EQ(RecordListAppend(other, &record), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(RecordListGet(other, 0, &record), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(RecordListLock(other, 0, &address), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(RecordListUnlock(other, 0), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(RecordListCount(other, &count), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(RecordListPeek(other, 0), nullptr);
  EXPECT_EQ(RecordListDispose(other), HOST_ERR_UTILITY_NULL);
}

TEST_F(RecordListTest, ALockedListCanBeDisposedOf) {
  RecordList* list = nullptr;
  ASSERT_EQ(RecordListCreate(4, 1, 2, &list), HOST_ERR_NONE);
  void* address = nullptr;
  ASSERT_EQ(RecordListLock(list, 1, &address), HOST_ERR_NONE);
  EXPECT_EQ(RecordListDispose(list), HOST_ERR_NONE);
}

}  // namespace
}  // namespace hostutil_tests
