#include "plugin/Guarded.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <new>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

#include "hostutil/HostSetup.h"

using namespace mayaimport;

namespace testsupport {
namespace {

using Reports = std::vector<std::pair<HostError, std::string>>;

class GuardedTest : public ::testing::Test {
 protected:
  GuardedTest() {
    HostSetReporter([](void* context, HostError code,
                       const char* text) { static_cast<Reports*>(context)->emplace_back(code, text); },
                    &reports_);
  }
  ~GuardedTest() override { HostSetReporter(nullptr, nullptr); }

  Reports reports_;
};

TEST_F(GuardedTest, WorkThatReturnsIsSuccess) {
  bool done = false;
  EXPECT_EQ(Guarded([&] { done = true; }), 0);
  EXPECT_TRUE(done);
  EXPECT_TRUE(reports_.empty());
}

TEST_F(GuardedTest, ABareIntegerIsTheCodeItself) {
  for (const int code : {13, 1289985, -1, 0}) EXPECT_EQ(Guarded([&] { throw int{code}; }), code);
  EXPECT_TRUE(reports_.empty());
}

TEST_F(GuardedTest, AStandardExceptionIsTranslatedAndReportedOnce) {
  EXPECT_EQ(Guarded([] { throw std::bad_alloc(); }), HOST_ERR_EXCEPTION_MEMORY);
  EXPECT_EQ(Guarded([] { throw std::runtime_error("why"); }), HOST_ERR_EXCEPTION_OTHER);
  ASSERT_EQ(reports_.size(), 2u);
  EXPECT_EQ(reports_[0].first, HOST_ERR_EXCEPTION_MEMORY);
  EXPECT_EQ(reports_[1].first, HOST_ERR_EXCEPTION_OTHER);
  EXPECT_THAT(reports_[1].second, ::testing::HasSubstr("why"));
}

TEST_F(GuardedTest, AnyOtherExceptionPassesThrough) {
  EXPECT_THROW(Guarded([] { throw "text"; }), const char*);
  EXPECT_THROW(Guarded([] { throw 1.5; }), double);
}

TEST_F(GuardedTest, ACodeThatTheWorkReturnsIsTheCode) {
  for (const HostError code : {0, 13, -1}) EXPECT_EQ(Guarded([&] { return code; }), code);
  EXPECT_TRUE(reports_.empty());
}

TEST_F(GuardedTest, AtTheBorderNothingPassesThrough) {
  EXPECT_EQ(GuardedAtBorder([] { throw "text"; }), HOST_ERR_EXCEPTION_OTHER);
  EXPECT_EQ(GuardedAtBorder([]() -> HostError { throw 1.5; }), HOST_ERR_EXCEPTION_OTHER);
  EXPECT_EQ(GuardedAtBorder([] {}), 0);
  EXPECT_EQ(GuardedAtBorder([] { return HostError{77}; }), 77);
  EXPECT_EQ(GuardedAtBorder([] { throw int{78}; }), 78);
  EXPECT_TRUE(reports_.empty());
  EXPECT_EQ(GuardedAtBorder([] { throw std::bad_alloc(); }), HOST_ERR_EXCEPTION_MEMORY);
  EXPECT_EQ(reports_.size(), 1u);
}

TEST_F(GuardedTest, UnreportedWorkEndsWithItsStandardExceptionAndNothingIsShown) {
  bool done = false;
  Unreported([&] { done = true; });
  EXPECT_TRUE(done);
  EXPECT_NO_THROW(Unreported([] { throw std::runtime_error("why"); }));
  EXPECT_THROW(Unreported([] { throw int{5}; }), int);
  EXPECT_TRUE(reports_.empty());
}

TEST_F(GuardedTest, TheFirstCodeIsKept) {
  HostError kept = 0;
  KeepFirst(&kept, 0);
  EXPECT_EQ(kept, 0);
  KeepFirst(&kept, 5);
  KeepFirst(&kept, 6);
  KeepFirst(&kept, 0);
  EXPECT_EQ(kept, 5);
}

TEST_F(GuardedTest, ThrowCodeThrowsEveryCode) {
  for (const HostError code : {0, 13, -1}) {
    EXPECT_THAT([&] { ThrowCode(code); }, ::testing::Throws<int>(::testing::Eq(code)));
  }
}

TEST_F(GuardedTest, OnlyACodeThatIsNotZeroIsThrown) {
  EXPECT_NO_THROW(ThrowOnError(0));
  EXPECT_THAT([] { ThrowOnError(77); }, ::testing::Throws<int>(::testing::Eq(77)));
}

TEST_F(GuardedTest, TheImportersOwnCodesHaveTheirFixedNumbers) {
  EXPECT_EQ(kNullArgument, 3);
  EXPECT_EQ(kMissingSuite, 13);
  EXPECT_EQ(kReadingError, 1289985);
  EXPECT_EQ(kUnexpectedEnd, 1289986);
  EXPECT_EQ(kInconsistentKeys, 1289987);
}

}  // namespace
}  // namespace testsupport
