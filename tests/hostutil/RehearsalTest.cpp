// How failures are added, counted and chosen.
#include <gtest/gtest.h>

#include <cstring>
#include <new>
#include <stdexcept>
#include <string>
#include <vector>

#include "UtilityTest.h"
#include "hostutil/HostSetup.h"

namespace hostutil_tests {
namespace {

class RehearsalTest : public UtilityTest {
 protected:
  static void Add(const HostUtilityFailure& failure) {
    ASSERT_EQ(HostAddUtilityFailure(&failure), HOST_ERR_NONE);
  }

  // The codes of so many scans; -1, -2 and -3 for what is thrown.
  static std::vector<HostError> Scans(int count) {
    std::vector<HostError> codes;
    for (int i = 0; i < count; ++i) {
      double value = 0;
      try {
        codes.push_back(HostNumberScan("1", 1, &value));
      } catch (const std::bad_alloc&) {
        codes.push_back(-1);
      } catch (const std::runtime_error& error) {
        EXPECT_STREQ(error.what(), "rehearsed failure");
        codes.push_back(-2);
      } catch (const std::exception&) {
        codes.push_back(-4);
      } catch (...) {
        codes.push_back(-3);
      }
    }
    return codes;
  }
};

using Codes = std::vector<HostError>;

TEST_F(RehearsalTest, TheNthCallFailsAndNoOther) {
  Add({HOST_UTILITY_NumberScan, 3, 77, HOST_THROW_NOTHING});
  HostBeginRehearsal();
  EXPECT_EQ(Scans(5), (Codes{0, 0, 77, 0, 0}));
}

TEST_F(RehearsalTest, CallZeroIsEveryCall) {
  Add({HOST_UTILITY_NumberScan, 0, 77, HOST_THROW_NOTHING});
  HostBeginRehearsal();
  EXPECT_EQ(Scans(4), (Codes{77, 77, 77, 77}));
}

TEST_F(RehearsalTest, AFailureCanThrow) {
  Add({HOST_UTILITY_NumberScan, 2, 77, HOST_THROW_BAD_ALLOC});
  Add({HOST_UTILITY_NumberScan, 3, 77, HOST_THROW_RUNTIME_ERROR});
  Add({HOST_UTILITY_NumberScan, 4, 77, HOST_THROW_OTHER});
  HostBeginRehearsal();
  EXPECT_EQ(Scans(5), (Codes{0, -1, -2, -3, 0}));
  EXPECT_EQ(HostUtilityCallCount(HOST_UTILITY_NumberScan), 5) << "a call that throws is counted";
}

TEST_F(RehearsalTest, SeveralFailuresOfOneServiceAllWork) {
  Add({HOST_UTILITY_NumberScan, 4, 44, HOST_THROW_NOTHING});
  Add({HOST_UTILITY_NumberScan, 2, 22, HOST_THROW_NOTHING});
  HostBeginRehearsal();
  EXPECT_EQ(Scans(5), (Codes{0, 22, 0, 44, 0}));
}

TEST_F(RehearsalTest, OfFailuresThatFitOneCallTheFirstAddedCounts) {
  Add({HOST_UTILITY_NumberScan, 2, 22, HOST_THROW_NOTHING});
  Add({HOST_UTILITY_NumberScan, 0, 11, HOST_THROW_NOTHING});
  Add({HOST_UTILITY_NumberScan, 1, 33, HOST_THROW_NOTHING});
  HostBeginRehearsal();
  EXPECT_EQ(Scans(3), (Codes{11, 22, 11}));
}

TEST_F(RehearsalTest, AFailureIsForItsServiceOnly) {
  Add({HOST_UTILITY_RatioCompare, 0, 77, HOST_THROW_NOTHING});
  HostBeginRehearsal();
  EXPECT_EQ(Scans(2), (Codes{0, 0}));
}

TEST_F(RehearsalTest, FailuresWorkOnlyWhileTheRehearsalRuns) {
  Add({HOST_UTILITY_NumberScan, 0, 77, HOST_THROW_NOTHING});
  EXPECT_EQ(Scans(2), (Codes{0, 0}));
  HostBeginRehearsal();
  EXPECT_EQ(Scans(1), (Codes{77}));
  HostEndRehearsal();
  EXPECT_EQ(Scans(2), (Codes{0, 0}));
}

TEST_F(RehearsalTest, AFailureAddedWhileTheRehearsalRunsWorksFromThere) {
  HostBeginRehearsal();
  EXPECT_EQ(Scans(1), (Codes{0}));
  Add({HOST_UTILITY_NumberScan, 2, 77, HOST_THROW_NOTHING});
  EXPECT_EQ(Scans(2), (Codes{77, 0}));
}

TEST_F(RehearsalTest, CountsBeginAtZeroWithEachRehearsalAndStayAfterIt) {
  HostBeginRehearsal();
  Scans(3);
  HostEndRehearsal();
  EXPECT_EQ(HostUtilityCallCount(HOST_UTILITY_NumberScan), 3);
  Scans(2);
  EXPECT_EQ(HostUtilityCallCount(HOST_UTILITY_NumberScan), 3) << "calls outside a rehearsal are not counted";
  HostBeginRehearsal();
  EXPECT_EQ(HostUtilityCallCount(HOST_UTILITY_NumberScan), 0);
  Scans(1);
  EXPECT_EQ(HostUtilityCallCount(HOST_UTILITY_NumberScan), 1);
}

TEST_F(RehearsalTest, FailuresStayFromOneRehearsalToTheNextUntilTheyAreCleared) {
  Add({HOST_UTILITY_NumberScan, 2, 77, HOST_THROW_NOTHING});
  for (int i = 0; i < 2; ++i) {
    HostBeginRehearsal();
    EXPECT_EQ(Scans(3), (Codes{0, 77, 0}));
    HostEndRehearsal();
  }
  HostClearUtilityFailures();
  HostBeginRehearsal();
  EXPECT_EQ(Scans(3), (Codes{0, 0, 0}));
}

TEST_F(RehearsalTest, AFailureOutOfRangeIsRefused) {
  const HostUtilityFailure wrong[] = {{-1, 1, 7, 0},
                                      {HOST_UTILITY_COUNT, 1, 7, 0},
                                      {HOST_UTILITY_NumberScan, -1, 7, 0},
                                      {HOST_UTILITY_NumberScan, 1, 7, -1},
                                      {HOST_UTILITY_NumberScan, 1, 7, HOST_THROW_OTHER + 1}};
  for (const HostUtilityFailure& failure : wrong) {
    EXPECT_EQ(HostAddUtilityFailure(&failure), HOST_ERR_UTILITY_NULL);
  }
  EXPECT_EQ(HostAddUtilityFailure(nullptr), HOST_ERR_UTILITY_NULL);
  HostBeginRehearsal();
  EXPECT_EQ(Scans(2), (Codes{0, 0}));
}

TEST_F(RehearsalTest, AnUnknownServiceHasNoCalls) {
  EXPECT_EQ(HostUtilityCallCount(-1), 0);
  EXPECT_EQ(HostUtilityCallCount(HOST_UTILITY_COUNT), 0);
}

TEST_F(RehearsalTest, TheTableNamesEveryServiceOnce) {
  const std::vector<std::string> names = {
#define NAME(name) #name,
      HOST_UTILITY_TABLE(NAME)
#undef NAME
  };
  EXPECT_EQ(
      names,
      (std::vector<std::string>{
          "FileCreate",      "FileOpen",    "FileRead",         "FileClose",           "FileSize",
          "FileName",        "FileDispose", "StripExtension",   "RegisterStringTable", "ListCreate",
          "ListAppend",      "ListGet",     "ListLock",         "ListUnlock",          "ListCount",
          "StringMake",      "StringCopy",  "StringFormat",     "NumberScan",          "MatrixSetIdentity",
          "MatrixTranslate", "MatrixScale", "MatrixRotateAxis", "MatrixDecompose",     "RatioCompare"}));
  EXPECT_EQ(static_cast<std::size_t>(HOST_UTILITY_COUNT), names.size());
}

}  // namespace
}  // namespace hostutil_tests
