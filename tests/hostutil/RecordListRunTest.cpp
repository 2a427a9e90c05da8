#include <gtest/gtest.h>

#include <array>
#include <cstdint>
#include <vector>

#include "UtilityTest.h"
#include "hostutil/RecordList.h"

namespace hostutil_tests {
namespace {

class RecordListRunTest : public UtilityTest {
 protected:
  void SetUp() override { ASSERT_EQ(RecordListCreate(sizeof(std::int64_t), 4, 0, &list_), HOST_ERR_NONE); }
  void TearDown() override {
    EXPECT_EQ(RecordListDispose(list_), HOST_ERR_NONE);
    UtilityTest::TearDown();
  }

  std::vector<std::int64_t> Records() const {
    std::int64_t count = 0;
    EXPECT_EQ(RecordListCount(list_, &count), HOST_ERR_NONE);
    std::vector<std::int64_t> records;
    for (std::int64_t i = 0; i < count; ++i) {
      records.push_back(*static_cast<const std::int64_t*>(RecordListPeek(list_, i)));
    }
    return records;
  }

  RecordList* list_ = nullptr;
};

TEST_F(RecordListRunTest, ARunIsAppendedInItsOrder) {
  const std::array<std::int64_t, 3> first = {1, 2, 3};
  const std::array<std::int64_t, 9> second = {4, 5, 6, 7, 8, 9, 10, 11, 12};
  ASSERT_EQ(RecordListAppendRun(list_, first.data(), 3), HOST_ERR_NONE);
  ASSERT_EQ(RecordListAppendRun(list_, second.data(), 9), HOST_ERR_NONE);
  EXPECT_EQ(Records(), (std::vector<std::int64_t>{1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12}));
}

TEST_F(RecordListRunTest, ARunOfNoneChangesNothing) {
  const std::int64_t record = 1;
  EXPECT_EQ(RecordListAppendRun(list_, &record, 0), HOST_ERR_NONE);
  EXPECT_TRUE(Records().empty());
}

TEST_F(RecordListRunTest, WhatIsNoRunIsRefused) {
  const std::int64_t record = 1;
  EXPECT_EQ(RecordListAppendRun(nullptr, &record, 1), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(RecordListAppendRun(list_, nullptr, 1), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(RecordListAppendRun(list_, &record, -1), HOST_ERR_UTILITY_NULL);
  EXPECT_TRUE(Records().empty());
}

TEST_F(RecordListRunTest, ARunThatDoesNotFitTheMemoryChangesNothing) {
  const std::int64_t record = 1;
  ASSERT_EQ(RecordListAppend(list_, &record), HOST_ERR_NONE);
  EXPECT_EQ(RecordListAppendRun(list_, &record, INT64_MAX), HOST_ERR_LIST_MEMORY);
  EXPECT_EQ(RecordListAppendRun(list_, &record, INT64_MAX / 8), HOST_ERR_LIST_MEMORY);
  EXPECT_EQ(RecordListAppendRun(list_, &record, std::int64_t{1} << 58), HOST_ERR_LIST_MEMORY);
  EXPECT_EQ(Records(), (std::vector<std::int64_t>{1}));
}

TEST_F(RecordListRunTest, ALockedListTakesNoRunAndMakesNoRoom) {
  const std::array<std::int64_t, 2> run = {1, 2};
  ASSERT_EQ(RecordListAppendRun(list_, run.data(), 2), HOST_ERR_NONE);
  void* address = nullptr;
  ASSERT_EQ(RecordListLock(list_, 0, &address), HOST_ERR_NONE);
  EXPECT_EQ(RecordListAppendRun(list_, run.data(), 2), HOST_ERR_LIST_LOCKED);
  RecordListReserve(list_, 1000000);
  EXPECT_EQ(RecordListPeek(list_, 0), address);
  ASSERT_EQ(RecordListUnlock(list_, 0), HOST_ERR_NONE);
  EXPECT_EQ(Records(), (std::vector<std::int64_t>{1, 2}));
}

TEST_F(RecordListRunTest, WhatRoomWasMadeForIsAppendedWithoutGrowing) {
  constexpr std::int64_t kCount = 100000;
  RecordListReserve(list_, kCount);
  EXPECT_TRUE(Records().empty());
  const std::int64_t record = 7;
  ASSERT_EQ(RecordListAppend(list_, &record), HOST_ERR_NONE);
  const void* first = RecordListPeek(list_, 0);
  for (std::int64_t i = 1; i < kCount; ++i) ASSERT_EQ(RecordListAppend(list_, &record), HOST_ERR_NONE);
  EXPECT_EQ(RecordListPeek(list_, 0), first);
}

TEST_F(RecordListRunTest, RoomThatCannotBeMadeIsNoFailure) {
  for (const std::int64_t count :
       {INT64_MAX, INT64_MAX / 8, std::int64_t{1} << 58, std::int64_t{0}, std::int64_t{-1}, INT64_MIN}) {
    RecordListReserve(list_, count);
  }
  RecordListReserve(nullptr, 5);
  const std::int64_t record = 7;
  EXPECT_EQ(RecordListAppend(list_, &record), HOST_ERR_NONE);
  EXPECT_EQ(Records(), (std::vector<std::int64_t>{7}));
}

TEST_F(RecordListRunTest, ARunCountsAsOneAppendHoweverLongItIs) {
  const std::array<std::int64_t, 3> run = {1, 2, 3};
  HostBeginRehearsal();
  EXPECT_EQ(RecordListAppendRun(list_, run.data(), 3), HOST_ERR_NONE);
  EXPECT_EQ(RecordListAppend(list_, run.data()), HOST_ERR_NONE);
  EXPECT_EQ(RecordListAppendRun(list_, run.data(), 0), HOST_ERR_NONE);
  HostEndRehearsal();
  EXPECT_EQ(HostUtilityCallCount(HOST_UTILITY_ListAppend), 3);
}

TEST_F(RecordListRunTest, ARunThatFailsIsAppendedNotEvenInPart) {
  const std::array<std::int64_t, 3> run = {1, 2, 3};
  WithFailure({HOST_UTILITY_ListAppend, 2, 4711, HOST_THROW_NOTHING}, [&] {
    EXPECT_EQ(RecordListAppendRun(list_, run.data(), 2), HOST_ERR_NONE);
    EXPECT_EQ(RecordListAppendRun(list_, run.data(), 3), 4711);
    EXPECT_EQ(RecordListAppendRun(list_, run.data(), 1), HOST_ERR_NONE);
    EXPECT_EQ(HostUtilityCallCount(HOST_UTILITY_ListAppend), 3);
  });
  EXPECT_EQ(Records(), (std::vector<std::int64_t>{1, 2, 1}));
}

TEST_F(RecordListRunTest, ARunIsReadWhereItLiesAndCountsAsOneGet) {
  const std::array<std::int64_t, 4> records = {3, 5, 7, 9};
  ASSERT_EQ(RecordListAppendRun(list_, records.data(), 4), HOST_ERR_NONE);
  HostBeginRehearsal();
  const void* run = nullptr;
  ASSERT_EQ(RecordListGetRun(list_, 1, 3, &run), HOST_ERR_NONE);
  EXPECT_EQ(run, RecordListPeek(list_, 1));
  ASSERT_EQ(RecordListGetRun(list_, 0, 4, &run), HOST_ERR_NONE);
  EXPECT_EQ(run, RecordListPeek(list_, 0));
  EXPECT_EQ(HostUtilityCallCount(HOST_UTILITY_ListGet), 2);
}

TEST_F(RecordListRunTest, RecordsThatAreMissingAreNoRun) {
  const std::array<std::int64_t, 4> records = {3, 5, 7, 9};
  ASSERT_EQ(RecordListAppendRun(list_, records.data(), 4), HOST_ERR_NONE);
  constexpr std::pair<std::int64_t, std::int64_t> kRuns[] = {
      {-1, 2}, {0, 5},         {4, 1},         {2, 3},         {0, 0},        {4, 0},
      {0, -1}, {INT64_MIN, 1}, {1, INT64_MIN}, {INT64_MAX, 1}, {0, INT64_MAX}};
  for (const auto& [index, count] : kRuns) {
    const void* run = records.data();
    EXPECT_EQ(RecordListGetRun(list_, index, count, &run), HOST_ERR_LIST_INDEX) << index << " " << count;
    EXPECT_EQ(run, nullptr) << index << " " << count;
  }
}

TEST_F(RecordListRunTest, WhatIsNoListHasNoRun) {
  const void* run = list_;
  EXPECT_EQ(RecordListGetRun(nullptr, 0, 1, &run), HOST_ERR_UTILITY_NULL);
  EXPECT_EQ(run, nullptr);
  EXPECT_EQ(RecordListGetRun(list_, 0, 1, nullptr), HOST_ERR_UTILITY_NULL);
}

}  // namespace
}  // namespace hostutil_tests
