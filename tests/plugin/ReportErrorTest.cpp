#include "plugin/ReportError.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "hostutil/HostSetup.h"
#include "plugin/Globals.h"
#include "tests/support/FakeHost.h"
#include "tests/support/Ledger.h"

using namespace mayaimport;

namespace testsupport {
namespace {

using ::testing::IsEmpty;

class ReportErrorTest : public ::testing::Test {
 protected:
  ReportErrorTest() {
    G_plugin_idL = 815;
    EXPECT_EQ(RegisterMessages(), 0);
  }
  ~ReportErrorTest() override {
    UnregisterMessages();
    HostClearTranslations();
  }

  void Report(const char* context, MessageId id) {
    QZGP_SuiteHandler suites(host_.basicSuite());
    ReportError(suites, context, id);
  }

  void ExpectShown(const std::string& text) {
    ASSERT_EQ(host_.messages.size(), 1u);
    EXPECT_EQ(host_.messages[0].pluginId, 815);
    EXPECT_EQ(host_.messages[0].text, text);
    host_.messages.clear();
  }

  FakeHost host_;
};

TEST_F(ReportErrorTest, WithoutAContextTheTextStandsAlone) {
  Report(nullptr, kReadingMessage);
  ExpectShown("Error reading Maya file.");
}

TEST_F(ReportErrorTest, AContextComesFirst) {
  Report("camera1", kInconsistentKeysMessage);
  ExpectShown("camera1: Inconsistant number of keyframes for Maya camera.");
}

TEST_F(ReportErrorTest, AnEmptyContextIsOneToo) {
  Report("", kReadingMessage);
  ExpectShown(": Error reading Maya file.");
}

TEST_F(ReportErrorTest, MarkersInAContextAreNotReplaced) {
  Report("^^2 ^^1", kReadingMessage);
  ExpectShown("^^2 ^^1: Error reading Maya file.");
}

TEST_F(ReportErrorTest, ATranslatedPatternDecidesTheOrder) {
  ASSERT_EQ(HostSetTranslation("$$$/QZ/Maya_Import/LStr/0002", "^^2 (^^1)"), 0);
  Report("camera1", kReadingMessage);
  ExpectShown("Error reading Maya file. (camera1)");
}

TEST_F(ReportErrorTest, AMessageOf1023BytesIsShownAndALongerOneIsNot) {
  const std::string longest(1023, 'm');
  ASSERT_EQ(HostSetTranslation("$$$/QZ/Maya_Import/LStr/0003", longest.c_str()), 0);
  Report(nullptr, kReadingMessage);
  ExpectShown(longest);
  ASSERT_EQ(HostSetTranslation("$$$/QZ/Maya_Import/LStr/0003", (longest + "m").c_str()), 0);
  Report(nullptr, kReadingMessage);
  EXPECT_THAT(host_.messages, IsEmpty());
  EXPECT_THAT(host_.acquisitions.size(), 1u);
}

TEST_F(ReportErrorTest, AContextCountsForTheLength) {
  const std::string end = ": Error reading Maya file.";
  const std::string context(1023 - end.size(), 'c');
  Report(context.c_str(), kReadingMessage);
  ExpectShown(context + end);
  Report((context + "c").c_str(), kReadingMessage);
  EXPECT_THAT(host_.messages, IsEmpty());
}

TEST_F(ReportErrorTest, AFailedCopyOrFormatShowsNothing) {
  {
    const UtilityRehearsal failing(HOST_UTILITY_StringCopy, 1, 9);
    Report(nullptr, kReadingMessage);
  }
  {
    const UtilityRehearsal failing(HOST_UTILITY_StringFormat, 1, 9);
    Report("c", kReadingMessage);
  }
  EXPECT_THAT(host_.messages, IsEmpty());
  EXPECT_THAT(host_.acquisitions, IsEmpty());
}

TEST_F(ReportErrorTest, AFailedShowingChangesNothing) {
  host_.showMessageError = 99;
  EXPECT_NO_THROW(Report(nullptr, kReadingMessage));
  EXPECT_EQ(host_.messages.size(), 1u);
}

TEST_F(ReportErrorTest, WithoutTheUtilitySuiteItThrowsThirteen) {
  host_.acquireErrors[{"QZGP Utility Suite", 7}] = 1;
  EXPECT_THAT([&] { Report(nullptr, kReadingMessage); }, ::testing::Throws<int>(::testing::Eq(13)));
}

}  // namespace
}  // namespace testsupport
