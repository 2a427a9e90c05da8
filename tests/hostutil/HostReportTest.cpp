#include "hostutil/HostReport.h"

#include <gtest/gtest.h>

#include <new>
#include <stdexcept>
#include <string>
#include <vector>

#include "UtilityTest.h"

namespace hostutil_tests {
namespace {

struct Report {
  HostError code;
  std::string text;
};

class HostReportTest : public UtilityTest {
 protected:
  void SetUp() override {
    HostSetReporter(
        [](void* context, HostError code, const char* text) {
          static_cast<std::vector<Report>*>(context)->push_back({code, text});
        },
        &reports_);
  }

  std::vector<Report> reports_;
};

TEST_F(HostReportTest, AMemoryExceptionHasItsOwnCodeAndSentence) {
  EXPECT_EQ(TranslateAndReport(std::bad_alloc()), HOST_ERR_EXCEPTION_MEMORY);
  ASSERT_EQ(reports_.size(), 1u);
  EXPECT_EQ(reports_[0].code, HOST_ERR_EXCEPTION_MEMORY);
  EXPECT_EQ(reports_[0].text, "the memory is exhausted: std::bad_alloc");
}

TEST_F(HostReportTest, ADescendantOfTheMemoryExceptionCountsAsOne) {
  EXPECT_EQ(TranslateAndReport(std::bad_array_new_length()), HOST_ERR_EXCEPTION_MEMORY);
}

TEST_F(HostReportTest, EveryOtherExceptionIsShownWithWhatItSays) {
  EXPECT_EQ(TranslateAndReport(std::runtime_error("disk on fire")), HOST_ERR_EXCEPTION_OTHER);
  ASSERT_EQ(reports_.size(), 1u);
  EXPECT_EQ(reports_[0].code, HOST_ERR_EXCEPTION_OTHER);
  EXPECT_EQ(reports_[0].text, "an unexpected failure inside the importer or the host: disk on fire");
}

TEST_F(HostReportTest, AnUnknownKindCountsAsAnother) {
  EXPECT_EQ(HostTranslateAndReport(77, "x"), HOST_ERR_EXCEPTION_OTHER);
}

TEST_F(HostReportTest, WithoutATextOnlyTheSentenceIsShown) {
  HostTranslateAndReport(HOST_EXCEPTION_MEMORY, nullptr);
  HostTranslateAndReport(HOST_EXCEPTION_MEMORY, "");
  ASSERT_EQ(reports_.size(), 2u);
  EXPECT_EQ(reports_[0].text, "the memory is exhausted");
  EXPECT_EQ(reports_[1].text, "the memory is exhausted");
}

TEST_F(HostReportTest, BytesThatAreNoUTF8AreShownAsTheReplacementCharacter) {
  HostTranslateAndReport(HOST_EXCEPTION_MEMORY, "\xC3\xA9\xFF");
  ASSERT_EQ(reports_.size(), 1u);
  EXPECT_EQ(reports_[0].text, "the memory is exhausted: \xC3\xA9\xEF\xBF\xBD");
}

TEST_F(HostReportTest, ALongMessageIsCutAt1023BytesAndNeverInsideACharacter) {
  std::string what;
  for (int i = 0; i < 1000; ++i) what += "\xE2\x82\xAC";
  const std::string sentence = "the memory is exhausted: ";
  for (std::size_t shift = 0; shift < 3; ++shift) {
    reports_.clear();
    const std::string shifted = std::string(shift, 'x') + what;
    HostTranslateAndReport(HOST_EXCEPTION_MEMORY, shifted.c_str());
    ASSERT_EQ(reports_.size(), 1u);
    const std::string& text = reports_[0].text;
    EXPECT_LE(text.size(), 1023u);
    EXPECT_GT(text.size(), 1020u);
    EXPECT_EQ((text.size() - sentence.size() - shift) % 3, 0u);
    EXPECT_EQ(text, (sentence + shifted).substr(0, text.size()));
  }
}

TEST_F(HostReportTest, WithoutAReporterTheCodeIsReturnedAllTheSame) {
  HostSetReporter(nullptr, nullptr);
  EXPECT_EQ(HostTranslateAndReport(HOST_EXCEPTION_MEMORY, "x"), HOST_ERR_EXCEPTION_MEMORY);
  EXPECT_EQ(HostTranslateAndReport(HOST_EXCEPTION_OTHER, nullptr), HOST_ERR_EXCEPTION_OTHER);
  EXPECT_TRUE(reports_.empty());
}

TEST_F(HostReportTest, ANotedLineIsTakenOnceByTheCodeThatItIsFor) {
  HostNoteLine(2043, 7);
  EXPECT_EQ(HostTakeNotedLine(2043), 7);
  EXPECT_EQ(HostTakeNotedLine(2043), 0);
}

TEST_F(HostReportTest, ANotedLineIsGoneWhenAnotherCodeAsksForIt) {
  HostNoteLine(2043, 7);
  EXPECT_EQ(HostTakeNotedLine(2044), 0);
  EXPECT_EQ(HostTakeNotedLine(2043), 0);
}

TEST_F(HostReportTest, TheLastNotedLineCounts) {
  HostNoteLine(2043, 7);
  HostNoteLine(2044, 9);
  EXPECT_EQ(HostTakeNotedLine(2044), 9);
}

}  // namespace
}  // namespace hostutil_tests
