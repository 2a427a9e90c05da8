// Runs of numbers as a service: how many, up to where, and what a rehearsal counts and fails. Which numbers
// are plain is the scanner's (tests/scan/PlainNumberTest.cpp).
#include <gtest/gtest.h>

#include <cstdint>
#include <new>
#include <stdexcept>
#include <string>
#include <vector>

#include "UtilityTest.h"
#include "hostutil/HostNumbers.h"
#include "tests/support/GuardedMemory.h"

namespace hostutil_tests {
namespace {

constexpr std::int64_t kCapacity = 64;
constexpr double kUntouched = 4711.25;

// What a call left behind, also when it threw.
struct Numbers {
  HostError code = -1;
  std::vector<double> values;
  std::int64_t taken = -1;  // bytes up to *after
  bool nothingElseWritten = true;
};

class HostNumberRunTest : public UtilityTest {
 protected:
  // The page after the text may not be touched, so that a byte too far ends the program.
  Numbers Scan(const std::string& text, std::int64_t capacity = kCapacity, char terminator = ';') {
    const testsupport::GuardedText guarded(text);
    std::vector<double> numbers(static_cast<std::size_t>(kCapacity), kUntouched);
    const char* after = nullptr;
    std::int64_t count = -1;
    Numbers run;
    try {
      run.code = HostNumberScanRun(guarded.begin(), guarded.end(), terminator, numbers.data(), capacity,
                                   &count, &after);
    } catch (const std::bad_alloc&) {
      run.code = -2;
    } catch (const std::runtime_error&) {
      run.code = -3;
    }
    run.taken = after - guarded.begin();
    for (std::int64_t i = 0; i < kCapacity; ++i) {
      const double number = numbers[static_cast<std::size_t>(i)];
      if (i < count) {
        run.values.push_back(number);
      } else {
        run.nothingElseWritten = run.nothingElseWritten && number == kUntouched;
      }
    }
    return run;
  }
};

using Values = std::vector<double>;

TEST_F(HostNumberRunTest, NumbersAreReadUpToWhatIsNone) {
  const Numbers run = Scan(" 1 0.5\n-2 1e-3 \"x\" 7;");
  EXPECT_EQ(run.code, HOST_ERR_NONE);
  EXPECT_EQ(run.values, (Values{1, 0.5, -2, 1e-3}));
  EXPECT_EQ(run.taken, 14);
  EXPECT_TRUE(run.nothingElseWritten);
}

TEST_F(HostNumberRunTest, TheLastNumberIsFollowedByWhiteSpaceOrTheTerminator) {
  EXPECT_EQ(Scan("1 0 2 5.5;").values, (Values{1, 0, 2, 5.5}));
  EXPECT_EQ(Scan("1 0 2 5.5,").values, (Values{1, 0, 2}));
  EXPECT_EQ(Scan("1 0 2 5.5,", kCapacity, ',').values, (Values{1, 0, 2, 5.5}));
  EXPECT_EQ(Scan("1 0 2 5.5#;").values, (Values{1, 0, 2}));
  EXPECT_EQ(Scan("1 0 2 5.5").values, (Values{1, 0, 2}));
}

TEST_F(HostNumberRunTest, WhereThereIsNoneThePlaceIsTheTextsBeginning) {
  for (const char* text : {"", ";", "x 1;", "  23.976fps;", "1", "\"1\" 2;"}) {
    const Numbers run = Scan(text);
    EXPECT_EQ(run.code, HOST_ERR_NONE) << text;
    EXPECT_TRUE(run.values.empty()) << text;
    EXPECT_EQ(run.taken, 0) << text;
  }
}

TEST_F(HostNumberRunTest, NoMoreThanTheCapacityIsRead) {
  const Numbers run = Scan("1 2 3 4 5;", 3);
  EXPECT_EQ(run.values, (Values{1, 2, 3}));
  EXPECT_EQ(run.taken, 5);
  EXPECT_TRUE(run.nothingElseWritten);
  EXPECT_TRUE(Scan("1 2;", 0).values.empty());
}

TEST_F(HostNumberRunTest, EveryNumberThatIsTakenCountsAsOneScan) {
  HostBeginRehearsal();
  Scan("1 2 3 4 x 5;");
  EXPECT_EQ(HostUtilityCallCount(HOST_UTILITY_NumberScan), 4);
  Scan("1 2 3 4;", 3);
  EXPECT_EQ(HostUtilityCallCount(HOST_UTILITY_NumberScan), 7);
  Scan("x");
  EXPECT_EQ(HostUtilityCallCount(HOST_UTILITY_NumberScan), 7);
}

constexpr std::int64_t kNumbers = 5;
const char* const kText = "1 2.5\n-3 4 5;";
const Values kValues = {1, 2.5, -3, 4, 5};
constexpr std::int64_t kPlaces[] = {0, 1, 5, 8, 10, 12};  // after so many numbers

TEST_F(HostNumberRunTest, EveryNumberCanFailAndThoseBeforeItAreHandedOut) {
  for (std::int64_t nth = 1; nth <= kNumbers; ++nth) {
    WithFailure({HOST_UTILITY_NumberScan, nth, 4711, HOST_THROW_NOTHING}, [&] {
      const Numbers run = Scan(kText);
      EXPECT_EQ(run.code, 4711) << nth;
      EXPECT_EQ(run.values, Values(kValues.begin(), kValues.begin() + nth - 1)) << nth;
      EXPECT_EQ(run.taken, kPlaces[nth - 1]) << nth;
      EXPECT_TRUE(run.nothingElseWritten) << nth;
      EXPECT_EQ(HostUtilityCallCount(HOST_UTILITY_NumberScan), nth) << "those after it are not read";
    });
  }
}

TEST_F(HostNumberRunTest, EveryNumberCanThrowAndThoseBeforeItAreHandedOut) {
  for (std::int64_t nth = 1; nth <= kNumbers; ++nth) {
    for (const std::int32_t thrown : {HOST_THROW_BAD_ALLOC, HOST_THROW_RUNTIME_ERROR}) {
      WithFailure({HOST_UTILITY_NumberScan, nth, 4711, thrown}, [&] {
        const Numbers run = Scan(kText);
        EXPECT_EQ(run.code, thrown == HOST_THROW_BAD_ALLOC ? -2 : -3) << nth;
        EXPECT_EQ(run.values, Values(kValues.begin(), kValues.begin() + nth - 1)) << nth;
        EXPECT_EQ(run.taken, kPlaces[nth - 1]) << nth;
        EXPECT_EQ(HostUtilityCallCount(HOST_UTILITY_NumberScan), nth);
      });
    }
  }
}

TEST_F(HostNumberRunTest, WithCodeZeroANumberIsZeroAndTheReadingGoesOn) {
  for (std::int64_t nth = 1; nth <= kNumbers; ++nth) {
    WithFailure({HOST_UTILITY_NumberScan, nth, 0, HOST_THROW_NOTHING}, [&] {
      Values expected = kValues;
      expected[static_cast<std::size_t>(nth - 1)] = 0;
      const Numbers run = Scan(kText);
      EXPECT_EQ(run.code, HOST_ERR_NONE) << nth;
      EXPECT_EQ(run.values, expected) << nth;
      EXPECT_EQ(run.taken, kPlaces[kNumbers]) << nth;
    });
  }
  WithFailure({HOST_UTILITY_NumberScan, 0, 0, HOST_THROW_NOTHING},
              [&] { EXPECT_EQ(Scan(kText).values, Values(kNumbers, 0)); });
}

TEST_F(HostNumberRunTest, AFailureAfterTheLastNumberIsForTheNextCall) {
  WithFailure({HOST_UTILITY_NumberScan, kNumbers + 1, 4711, HOST_THROW_NOTHING}, [&] {
    EXPECT_EQ(Scan(kText).code, HOST_ERR_NONE);
    EXPECT_EQ(Scan(kText).code, 4711);
  });
}

}  // namespace
}  // namespace hostutil_tests
