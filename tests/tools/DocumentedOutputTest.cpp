// The outputs that the documents show are those that the tool prints.
#include <gmock/gmock.h>

#include <fstream>
#include <iterator>

#include "tests/tools/ToolRun.h"

namespace mayascene_test {
namespace {

using ::testing::HasSubstr;

// The tool runs at the top of the project, so that paths are shown as a reader has them.
class DocumentedOutput : public ToolTest {
 protected:
  DocumentedOutput() { workingFolder = MAYASCENE_SOURCE_DIR; }

  static std::string document(const std::string& name) {
    std::ifstream in(std::string(MAYASCENE_SOURCE_DIR) + "/" + name, std::ios::binary);
    return {std::istreambuf_iterator<char>(in), {}};
  }
};

TEST_F(DocumentedOutput, TheReadmeShowsWhatItsFirstCommandPrints) {
  const std::string readme = document("README.md");
  const std::string command = "    scripts/import ";
  const std::size_t begin = readme.find(command);
  ASSERT_NE(begin, std::string::npos);
  const std::size_t scene = begin + command.size();
  const ToolResult import = run({"import", readme.substr(scene, readme.find('\n', scene) - scene)});
  EXPECT_EQ(import.status, 0);
  EXPECT_THAT(readme, HasSubstr("```\n" + import.out + import.err + "```\n"));
}

TEST_F(DocumentedOutput, TheReadmeShowsTheReportOfARefusedScene) {
  const ToolResult check = run({"check", "--quiet", "tests/scenes/production/path_without_quotes.ma"});
  EXPECT_EQ(check.status, 1);
  EXPECT_THAT(document("README.md"), HasSubstr("```\n" + check.out + "```\n"));
}

TEST_F(DocumentedOutput, ThePageOnCheckingShowsAReportAsItIsPrinted) {
  const ToolResult check = run({"check", "tests/scenes/production/path_without_quotes.ma"});
  EXPECT_THAT(document("docs/checking.md"), HasSubstr("```\n" + check.out + "```\n"));
}

TEST_F(DocumentedOutput, ThePageOnCheckingShowsAHeadAsItIsPrinted) {
  const std::string report = run({"check", "examples/look_at_dancer.ma"}).out;
  EXPECT_THAT(document("docs/checking.md"),
              HasSubstr("```\n" + report.substr(0, report.find("\n\n") + 1) + "```\n"));
}

}  // namespace
}  // namespace mayascene_test
