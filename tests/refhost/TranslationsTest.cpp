#include "refhost/Translations.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "tests/support/TemporaryFolder.h"

namespace refhost {
namespace {

using testsupport::TemporaryFolder;

using ::testing::ElementsAre;
using ::testing::EndsWith;
using ::testing::HasSubstr;
using ::testing::Pair;

TEST(Translations, KeyAndTextAreCutAtTheFirstEqualsSign) {
  const TemporaryFolder folder;
  std::string complaint;
  const auto read = readTranslations(
      folder.write("de", "# Deutsch\n\n$$$/a=Maya-Szene\r\n$$$/b=x=y\n$$$/c=\n"), &complaint);
  ASSERT_TRUE(read.has_value()) << complaint;
  EXPECT_THAT(*read, ElementsAre(Pair("$$$/a", "Maya-Szene"), Pair("$$$/b", "x=y"), Pair("$$$/c", "")));
}

TEST(Translations, LastLineNeedsNoLineEnd) {
  const TemporaryFolder folder;
  std::string complaint;
  const auto read = readTranslations(folder.write("de", "k=t"), &complaint);
  ASSERT_TRUE(read.has_value());
  EXPECT_THAT(*read, ElementsAre(Pair("k", "t")));
}

TEST(Translations, LineWithoutEqualsSignIsReportedByItsNumber) {
  const TemporaryFolder folder;
  std::string complaint;
  EXPECT_FALSE(readTranslations(folder.write("de", "# c\nk=t\nwrong\n"), &complaint).has_value());
  EXPECT_THAT(complaint, EndsWith("de:3: the line has no \"=\""));
}

TEST(Translations, MissingFileIsReportedInWords) {
  const TemporaryFolder folder;
  std::string complaint;
  EXPECT_FALSE(readTranslations(folder.path() / "none", &complaint).has_value());
  EXPECT_THAT(complaint, HasSubstr("cannot be read"));
}

TEST(Translations, FolderIsNoFile) {
  const TemporaryFolder folder;
  std::string complaint;
  EXPECT_FALSE(readTranslations(folder.path(), &complaint).has_value());
  EXPECT_THAT(complaint, HasSubstr("cannot be read"));
}

}  // namespace
}  // namespace refhost
