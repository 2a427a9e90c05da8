// Lists so large that they are made of whole pages of the system.
#include <sys/mman.h>
#include <unistd.h>

#include <cstring>
#include <fstream>
#include <vector>

#include "UtilityTest.h"

namespace hostutil_tests {
namespace {

constexpr int64_t kMegabyte = int64_t{1} << 20;

// A list of five records of a megabyte each, which takes three large pages of two.
class LargeListsTest : public UtilityTest {
 protected:
  void SetUp() override {
    ASSERT_EQ(RecordListCreate(kMegabyte, 1, 0, &list_), HOST_ERR_NONE);
    RecordListReserve(list_, kRecords);
    for (int64_t i = 0; i < kRecords; ++i) ASSERT_EQ(Append(i), HOST_ERR_NONE);
    first_ = RecordListPeek(list_, 0);
  }
  void TearDown() override {
    EXPECT_EQ(RecordListDispose(list_), HOST_ERR_NONE);
    UtilityTest::TearDown();
  }

  static std::vector<unsigned char> Record(int64_t number) {
    return std::vector<unsigned char>(kMegabyte, static_cast<unsigned char>(number + 1));
  }
  HostError Append(int64_t number) { return RecordListAppend(list_, Record(number).data()); }

  void ExpectRecords(int64_t count) {
    int64_t counted = 0;
    EXPECT_EQ(RecordListCount(list_, &counted), HOST_ERR_NONE);
    EXPECT_EQ(counted, count);
    for (int64_t i = 0; i < count; ++i) {
      EXPECT_EQ(std::memcmp(RecordListPeek(list_, i), Record(i).data(), kMegabyte), 0) << i;
    }
  }

  static constexpr int64_t kRecords = 5;
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
  for (int64_t i = kRecords; i < 3 * kRecords; ++i) ASSERT_EQ(Append(i), HOST_ERR_NONE);
  ExpectRecords(3 * kRecords);
}

TEST_F(LargeListsTest, AListForWhichThereAreNoAddressesStaysAsItIs) {
  constexpr int64_t kBeyondTheAddressSpace = int64_t{1} << 42;
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

// Takes all but a few of the mappings that the system lets a process have: one can still be made, but none be
// moved.
class FewMappingsLeft {
 public:
  FewMappingsLeft() : page_(static_cast<std::size_t>(sysconf(_SC_PAGESIZE))) {
    std::size_t most = 0;
    std::ifstream("/proc/sys/vm/max_map_count") >> most;
    constexpr std::size_t kTooLong = 1000000;  // to fill
    if (most == 0 || most > kTooLong) return;
    size_ = 2 * most * page_;
    region_ = mmap(nullptr, size_, PROT_NONE, MAP_PRIVATE | MAP_ANONYMOUS | MAP_NORESERVE, -1, 0);
    if (region_ == MAP_FAILED) return;
    // Every other page with another protection is a mapping of its own.
    std::size_t at = 0;
    while (at < size_ && Protect(at, PROT_READ)) at += 2 * page_;
    full_ = at < size_;
    if (full_) Protect(at - 2 * page_, PROT_NONE);
  }
  ~FewMappingsLeft() {
    if (region_ != MAP_FAILED) munmap(region_, size_);
  }
  FewMappingsLeft(const FewMappingsLeft&) = delete;
  FewMappingsLeft& operator=(const FewMappingsLeft&) = delete;

  bool full() const { return full_; }

 private:
  bool Protect(std::size_t at, int protection) {
    return mprotect(static_cast<char*>(region_) + at, page_, protection) == 0;
  }

  std::size_t page_;
  std::size_t size_ = 0;
  void* region_ = MAP_FAILED;
  bool full_ = false;
};

TEST_F(LargeListsTest, AListThatTheSystemDoesNotMoveStaysAsItIs) {
  const std::vector<unsigned char> records(3 * kMegabyte, 9);
  HostError code = HOST_ERR_NONE;
  bool full = false;
  {
    const FewMappingsLeft few;
    full = few.full();
    code = RecordListAppendRun(list_, records.data(), 3);
  }
  if (!full) GTEST_SKIP() << "the system sets no bound that could be reached";
  EXPECT_EQ(code, HOST_ERR_LIST_MEMORY);
  EXPECT_EQ(RecordListPeek(list_, 0), first_);
  ExpectRecords(kRecords);
  EXPECT_EQ(RecordListAppendRun(list_, records.data(), 3), HOST_ERR_NONE) << "later there is room again";
  EXPECT_EQ(std::memcmp(RecordListPeek(list_, kRecords), records.data(), 3 * kMegabyte), 0);
}

TEST_F(LargeListsTest, AdviceAboutNoMemoryIsIgnored) { HostAdviseLargePages(nullptr, 8 * kMegabyte); }

}  // namespace
}  // namespace hostutil_tests
