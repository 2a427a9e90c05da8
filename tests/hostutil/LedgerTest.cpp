#include <gtest/gtest.h>

#include <cstdint>
#include <string>
#include <vector>

#include "UtilityTest.h"
#include "hostutil/HostSetup.h"

namespace hostutil_tests {
namespace {

class LedgerTest : public UtilityTest {};

RecordList* MakeList(std::int64_t recordSize, std::int64_t initial) {
  RecordList* list = nullptr;
  EXPECT_EQ(RecordListCreate(recordSize, 10, initial, &list), HOST_ERR_NONE);
  return list;
}

std::vector<std::string> Descriptions() {
  std::vector<std::string> descriptions;
  for (const LedgerLine& line : Ledger()) descriptions.push_back(line.description);
  return descriptions;
}

TEST_F(LedgerTest, WithoutObjectsTheLedgerIsEmpty) { EXPECT_TRUE(Ledger().empty()); }

TEST_F(LedgerTest, FilesAndListsStandInTheOrderInWhichTheyWereMade) {
  RecordList* list1 = MakeList(16, 3);
  HostFile* file1 = MakeFile("/shots/one.ma");
  RecordList* list2 = MakeList(344, 0);
  HostFile* file2 = MakeFile("two.ma");
  const std::vector<LedgerLine> ledger = Ledger();
  ASSERT_EQ(ledger.size(), 4u);
  EXPECT_EQ(ledger[0].kind, HOST_LEDGER_LIST);
  EXPECT_EQ(ledger[0].description, "list of 3 records of 16 bytes");
  EXPECT_EQ(ledger[1].kind, HOST_LEDGER_FILE);
  EXPECT_EQ(ledger[1].description, "file /shots/one.ma");
  EXPECT_EQ(ledger[2].kind, HOST_LEDGER_LIST);
  EXPECT_EQ(ledger[2].description, "list of 0 records of 344 bytes");
  EXPECT_EQ(ledger[3].kind, HOST_LEDGER_FILE);
  EXPECT_EQ(ledger[3].description, "file two.ma");
  for (const LedgerLine& line : ledger) EXPECT_EQ(line.releaseFailed, 0);
  EXPECT_EQ(RecordListDispose(list2), HOST_ERR_NONE);
  EXPECT_EQ(Descriptions(),
            (std::vector<std::string>{"list of 3 records of 16 bytes", "file /shots/one.ma", "file two.ma"}));
  EXPECT_EQ(HostFileDispose(file2), HOST_ERR_NONE);
  EXPECT_EQ(RecordListDispose(list1), HOST_ERR_NONE);
  EXPECT_EQ(Descriptions(), (std::vector<std::string>{"file /shots/one.ma"}));
  EXPECT_EQ(HostFileDispose(file1), HOST_ERR_NONE);
  EXPECT_TRUE(Ledger().empty());
}

TEST_F(LedgerTest, TextsAreNotInTheLedgerAndAreFreedWithTheLeftovers) {
  UTF16String* text = MakeText("scene");
  UTF16StringRetain(text);
  EXPECT_TRUE(Ledger().empty());
  HostReleaseLeftovers();  // a leak would show at the end of the process
}

TEST_F(LedgerTest, ADescriptionIsOneLineWhateverThePathHolds) {
  HostFile* file = MakeFile("a\nb\x1B[1m\x7F\xC2\x85\xE2\x80\xA8\xE2\x80\xA9\xFF\xC3\xA9");
  EXPECT_EQ(
      Descriptions(),
      (std::vector<std::string>{"file a\\u000ab\\u001b[1m\\u007f\\u0085\\u2028\\u2029\xEF\xBF\xBD\xC3\xA9"}));
  EXPECT_EQ(HostFileDispose(file), HOST_ERR_NONE);
}

TEST_F(LedgerTest, ReleasingTheLeftoversEmptiesTheLedger) {
  MakeList(16, 100);
  MakeFile("one.ma");
  HostReleaseLeftovers();
  EXPECT_TRUE(Ledger().empty());
  HostReleaseLeftovers();
  RecordList* list = MakeList(8, 0);
  EXPECT_EQ(Ledger().size(), 1u);
  EXPECT_EQ(RecordListDispose(list), HOST_ERR_NONE);
}

TEST_F(LedgerTest, AFileReleasedWithTheLeftoversIsAForeignHandleAfterwards) {
  HostFile* file = MakeFile("one.ma");
  HostReleaseLeftovers();
  EXPECT_EQ(HostFileClose(file), HOST_ERR_UTILITY_NULL);
}

TEST_F(LedgerTest, ANullVisitorVisitsNothing) {
  RecordList* list = MakeList(8, 0);
  HostVisitLedger(nullptr, nullptr);
  EXPECT_EQ(RecordListDispose(list), HOST_ERR_NONE);
}

TEST_F(LedgerTest, AFileWhoseReleaseWasMadeToFailIsMarked) {
  for (const HostUtilityFailure& failure :
       {HostUtilityFailure{HOST_UTILITY_FileDispose, 1, 77, HOST_THROW_NOTHING},
        HostUtilityFailure{HOST_UTILITY_FileDispose, 1, 0, HOST_THROW_NOTHING},
        HostUtilityFailure{HOST_UTILITY_FileDispose, 1, 0, HOST_THROW_BAD_ALLOC},
        HostUtilityFailure{HOST_UTILITY_FileDispose, 1, 0, HOST_THROW_RUNTIME_ERROR}}) {
    HostFile* kept = MakeFile("kept.ma");
    HostFile* other = MakeFile("other.ma");
    WithFailure(failure, [&] {
      try {
        EXPECT_EQ(HostFileDispose(kept), failure.code);
        EXPECT_EQ(failure.thrown, HOST_THROW_NOTHING);
      } catch (const std::exception&) {
        EXPECT_NE(failure.thrown, HOST_THROW_NOTHING);
      }
    });
    const std::vector<LedgerLine> ledger = Ledger();
    ASSERT_EQ(ledger.size(), 2u);
    EXPECT_EQ(ledger[0].releaseFailed, 1);
    EXPECT_EQ(ledger[1].releaseFailed, 0);
    EXPECT_EQ(HostFileDispose(other), HOST_ERR_NONE);
    EXPECT_EQ(HostFileDispose(kept), HOST_ERR_NONE)
        << "the object is alive, and its release can be tried again";
  }
}

}  // namespace
}  // namespace hostutil_tests
