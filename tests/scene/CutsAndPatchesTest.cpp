// A scene cut at every byte, and with every byte replaced.
#include <algorithm>

#include "tests/scene/CheckedScene.h"
#include "tests/scene/RichScene.h"
#include "tests/scene/SceneFixture.h"

namespace scene {
namespace {

using testsupport::BrokenPromise;
using testsupport::Describe;
using testsupport::ScenePieces;

class CutsAndPatchesTest : public SceneTest {
 protected:
  // The names of the nodes that the piece creates: one or none.
  static std::string_view CreatedBy(std::string_view piece) {
    if (piece.substr(0, 10) != "createNode") return {};
    const std::size_t start = piece.find("-n \"") + 4;
    return piece.substr(start, piece.find('"', start) - start);
  }

  bool HasNode(std::string_view name) const {
    return std::any_of(scene_.nodes().begin(), scene_.nodes().end(), [name](const Node& node) {
      return node.origin == Origin::Created &&
             (node.name == name || node.name == "late:" + std::string(name));
    });
  }
};

TEST_F(CutsAndPatchesTest, TheWholeSceneHasNothingWrong) {
  Read(testsupport::WholeScene());
  EXPECT_THAT(Diagnostics(),
              testing::ElementsAre(testing::HasSubstr("MA0211"), testing::HasSubstr("MA0205")));
  EXPECT_EQ(BrokenPromise(scene_, collector()), "");
  EXPECT_EQ(scene_.PathOf(At("lens")), "|rig|move|lens");
  EXPECT_EQ(scene_.Number(At("rig"), "tz"), 300.0);
  EXPECT_EQ(SourceOf("look", "tg[0].ttx"), "rig.translateX");
  EXPECT_EQ(SourceOf("lens", "fl"), "rig.focal");
  EXPECT_EQ(At("|another|ns:loc"), At("|rig|ns:loc"));
  EXPECT_NE(scene_.Find("late:comer"), kNoNode);
}

// A command that is cut does nothing; all before it stays.
TEST_F(CutsAndPatchesTest, ACutCostsTheLastCommandAndNothingElse) {
  const std::string whole = testsupport::WholeScene();
  std::size_t start = 0;
  for (const std::string_view piece : ScenePieces()) {
    Read(std::string_view(whole).substr(0, start));
    const std::string before = Describe(scene_);
    const std::uint64_t diagnosticsBefore = collector().count();
    const std::size_t end = piece.rfind(';');
    const bool command = piece[0] != '/' && end != std::string_view::npos;
    for (std::size_t cut = 1; cut <= (command ? end : piece.size()); ++cut) {
      SCOPED_TRACE("cut after: " + std::string(piece.substr(0, cut)));
      Read(std::string_view(whole).substr(0, start + cut));
      ASSERT_EQ(Describe(scene_), before);
      ASSERT_EQ(BrokenPromise(scene_, collector()), "");
      ASSERT_LE(collector().count(), diagnosticsBefore + 1);
      // Where something of a command is left, that is reported.
      const std::uint64_t reported = command && piece.find_first_not_of('\t') < cut ? 1 : 0;
      ASSERT_GE(collector().count(), diagnosticsBefore + reported);
    }
    start += piece.size();
  }
}

// Whatever one byte turns into, every node of the other commands is there.
TEST_F(CutsAndPatchesTest, AReplacedByteCostsNoOtherNode) {
  const std::string whole = testsupport::WholeScene();
  std::vector<std::size_t> starts = {0};
  for (const std::string_view piece : ScenePieces()) starts.push_back(starts.back() + piece.size());
  for (const char patch : {'\0', '\xff', '"', ';', '\\', '*', '/', '-', '\n', '9', '{', 'e'}) {
    for (std::size_t at = 0; at < whole.size(); ++at) {
      const auto piece =
          static_cast<std::size_t>(std::upper_bound(starts.begin(), starts.end(), at) - starts.begin() - 1);
      std::string text = whole;
      text[at] = patch;
      SCOPED_TRACE("piece " + std::string(ScenePieces()[piece]) + " byte " +
                   std::to_string(at - starts[piece]) + " as " +
                   std::to_string(static_cast<unsigned char>(patch)));
      Read(text);
      ASSERT_EQ(BrokenPromise(scene_, collector()), "");
      std::string_view patched = ScenePieces()[piece];
      if (patched[0] == '\t') patched.remove_prefix(1);
      // The last byte of a command may join it to the next one. A name may become another.
      if (at + 1 == starts[piece + 1] || patched.substr(0, 6) == "rename" ||
          patched.substr(0, 9) == "namespace")
        continue;
      for (std::size_t other = 0; other < ScenePieces().size(); ++other) {
        const std::string_view name = other == piece ? std::string_view() : CreatedBy(ScenePieces()[other]);
        if (name.empty() || name == "other") continue;
        ASSERT_TRUE(HasNode(name)) << name;
      }
    }
  }
}

TEST_F(CutsAndPatchesTest, EveryPieceMayBeMissingOrDoubled) {
  const std::vector<std::string_view>& pieces = ScenePieces();
  for (std::size_t i = 0; i < pieces.size(); ++i) {
    std::string without, twice;
    for (std::size_t j = 0; j < pieces.size(); ++j) {
      if (j != i) without += pieces[j];
      twice += std::string(pieces[j]) + (j == i ? std::string(pieces[j]) : std::string());
    }
    SCOPED_TRACE(std::string(pieces[i]));
    Read(without);
    ASSERT_EQ(BrokenPromise(scene_, collector()), "");
    Read(twice);
    ASSERT_EQ(BrokenPromise(scene_, collector()), "");
  }
}

}  // namespace
}  // namespace scene
