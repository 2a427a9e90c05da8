#include "tools/mayascene/SceneText.h"

#include <filesystem>
#include <fstream>
#include <numeric>
#include <string>

#include "tests/tools/ToolRun.h"

namespace mayascene {
namespace {

using Opening = decltype(&SceneText::open);

class SceneTexts : public mayascene_test::ToolTest, public testing::WithParamInterface<Opening> {
 protected:
  std::unique_ptr<SceneText> take(const std::string& name) { return GetParam()(path(name), &failure_); }

  std::string failure_;
};

INSTANTIATE_TEST_SUITE_P(ReadAndMapped, SceneTexts, testing::Values(&SceneText::open, &SceneText::map));

TEST_P(SceneTexts, TheTextIsTheWholeFile) {
  std::string bytes(100'003, '\0');
  std::iota(bytes.begin(), bytes.end(), '\x07');
  write("a.ma", bytes);
  const auto text = take("a.ma");
  ASSERT_NE(text, nullptr) << failure_;
  EXPECT_TRUE(text->text() == bytes);
}

TEST_P(SceneTexts, AnEmptyFileIsAnEmptyText) {
  write("a.ma", "");
  const auto text = take("a.ma");
  ASSERT_NE(text, nullptr) << failure_;
  EXPECT_EQ(text->text(), "");
}

TEST_P(SceneTexts, WhatIsNoFileIsRefusedWithTheReason) {
  EXPECT_EQ(take("missing.ma"), nullptr);
  EXPECT_EQ(failure_, "cannot be opened: No such file or directory");
  EXPECT_EQ(take(""), nullptr);
  EXPECT_EQ(failure_, "is a directory, not a file");
}

using SceneTextCutOff = mayascene_test::ToolTest;

TEST_F(SceneTextCutOff, WhatIsReadStaysAsItWas) {
  write("a.ma", std::string(50'000, 'x'));
  std::string failure;
  const auto text = SceneText::open(path("a.ma"), &failure);
  ASSERT_NE(text, nullptr) << failure;
  std::filesystem::resize_file(path("a.ma"), 10);
  EXPECT_TRUE(text->text() == std::string(50'000, 'x'));
}

TEST_F(SceneTextCutOff, WhatIsMappedEndsTheProcess) {
  write("a.ma", std::string(50'000, 'x'));
  const auto lookAfterTheEnd = [this] {
    std::string failure;
    const auto text = SceneText::map(path("a.ma"), &failure);
    std::filesystem::resize_file(path("a.ma"), 10);
    return text->text()[40'000];
  };
  EXPECT_DEATH(lookAfterTheEnd(), "");
}

}  // namespace
}  // namespace mayascene
