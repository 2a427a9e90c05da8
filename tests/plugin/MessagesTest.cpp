#include "plugin/Messages.h"

#include <gtest/gtest.h>

#include "hostapi/ErrorCodes.h"
#include "hostutil/HostSetup.h"
#include "tests/support/Ledger.h"

using namespace mayaimport;

namespace testsupport {
namespace {

struct Entry {
  MessageId id;
  std::int32_t number;
  const char* key;
  const char* text;
};

const Entry kEntries[] = {
    {kImporterName, 0, "$$$/QZ/Maya_Import/LStr/0000", "Maya Scene"},
    {kOnlyMayaAscii, 1, "$$$/QZ/Maya_Import/LStr/0001", "Only Baked Maya Ascii files are supported."},
    {kMessageWithContext, 2, "$$$/QZ/Maya_Import/LStr/0002", "^^1: ^^2"},
    {kReadingMessage, 3, "$$$/QZ/Maya_Import/LStr/0003", "Error reading Maya file."},
    {kUnexpectedEndMessage, 4, "$$$/QZ/Maya_Import/LStr/0004", "Unexpected end of maya file."},
    {kInconsistentKeysMessage, 5, "$$$/QZ/Maya_Import/LStr/0005",
     "Inconsistant number of keyframes for Maya camera."},
    {kSquareWord, 6, "$$$/QZ/Maya_Import/LStr/0006", "Square"},
    {kSquareNamePattern, 7, "$$$/QZ/Maya_Import/LStr/0007", "^^1 ^^2"},
};

class MessagesTest : public ::testing::Test {
 protected:
  ~MessagesTest() override {
    UnregisterMessages();
    HostClearTranslations();
  }
};

TEST_F(MessagesTest, EveryTextHasItsNumberAndItsDefault) {
  ASSERT_EQ(RegisterMessages(), 0);
  ASSERT_NE(Maya_Import_G_zref, nullptr);
  for (const Entry& entry : kEntries) {
    EXPECT_EQ(entry.id, entry.number);
    EXPECT_STREQ(LocalizedText(entry.id), entry.text);
  }
}

TEST_F(MessagesTest, EveryTextIsTranslatedByItsKey) {
  for (const Entry& entry : kEntries) {
    const std::string text = "translated " + std::to_string(entry.number);
    ASSERT_EQ(HostSetTranslation(entry.key, text.c_str()), 0);
  }
  ASSERT_EQ(RegisterMessages(), 0);
  for (const Entry& entry : kEntries)
    EXPECT_EQ(LocalizedText(entry.id), "translated " + std::to_string(entry.number));
}

TEST_F(MessagesTest, ThereIsNoNinthText) {
  ASSERT_EQ(RegisterMessages(), 0);
  EXPECT_STREQ(HostLocalizedString(Maya_Import_G_zref, 8), "");
}

TEST_F(MessagesTest, WithoutATableEveryTextIsEmpty) {
  EXPECT_STREQ(LocalizedText(kReadingMessage), "");
  ASSERT_EQ(RegisterMessages(), 0);
  UnregisterMessages();
  EXPECT_EQ(Maya_Import_G_zref, nullptr);
  EXPECT_STREQ(LocalizedText(kReadingMessage), "");
  UnregisterMessages();
}

TEST_F(MessagesTest, AFailedRegistrationIsItsCodeAndLeavesNoTable) {
  {
    const UtilityRehearsal failing(HOST_UTILITY_RegisterStringTable, 1, 88);
    EXPECT_EQ(RegisterMessages(), 88);
  }
  EXPECT_EQ(Maya_Import_G_zref, nullptr);
  EXPECT_EQ(RegisterMessages(), 0);
}

TEST_F(MessagesTest, TheTableIsNamedMayaImport) {
  ASSERT_EQ(RegisterMessages(), 0);
  const char* const entries[] = {"key=text"};
  HostStringTable* second = nullptr;
  EXPECT_EQ(HostRegisterStringTable("Maya_Import", entries, 1, &second), HOST_ERR_STRING_TABLE);
}

}  // namespace
}  // namespace testsupport
