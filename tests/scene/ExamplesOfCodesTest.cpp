// The example that the table of codes has for each code gives just that code.
#include "scene/Settings.h"
#include "tests/scene/SceneFixture.h"

namespace scene {
namespace {

class ExamplesOfCodes : public SceneTest {};

TEST_F(ExamplesOfCodes, EachGivesItsCode) {
  int looked = 0;
  for (const diag::Entry& entry : diag::Table()) {
    // Later codes are those of values, bakes and checks; a text that is too long has gigabytes.
    if (entry.code > diag::Code::ReferenceNotRead || entry.code == diag::Code::TextTooLong) continue;
    SCOPED_TRACE(std::string(entry.symbol));
    Read(std::string(entry.example) + (entry.code == diag::Code::CommandCutOff ? "" : "\n"));
    (void)ReadSettings(scene_, collector());
    EXPECT_GE(collector().CountOf(entry.code), 1u);
    for (const diag::Diagnostic& diagnostic : collector().kept()) {
      // What stands in a reference is said beside the reference itself.
      if (diagnostic.code == diag::Code::ReferenceNotRead) continue;
      EXPECT_EQ(diag::NameOf(diagnostic.code), diag::NameOf(entry.code))
          << diag::Render("example", diagnostic);
      EXPECT_EQ(diagnostic.arguments.size(), diag::ArgumentCount(entry));
    }
    ++looked;
  }
  EXPECT_EQ(looked, 20);
}

}  // namespace
}  // namespace scene
