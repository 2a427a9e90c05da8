// A scene cut at every byte, and with every byte replaced.
#include <optional>

#include "hostapi/ErrorCodes.h"
#include "tests/maya/RichScene.h"
#include "tests/support/ReaderFixture.h"

namespace testsupport {
namespace {

using ::testing::AnyOf;
using ::testing::Contains;
using ::testing::ElementsAre;
using ::testing::Eq;
using ::testing::IsEmpty;

class TruncationTest : public ReaderTest {
 protected:
  // What the end of the text after `cut` bytes of the piece gives, derived from the piece's own tokens.
  HostError Predict(const ScenePiece& piece, std::size_t cut) {
    const std::string_view text(piece.text);
    MAYA_Lex lex(host_.basicSuite(), piece.text);
    int whole = 0;
    for (const char* start = nullptr;; ++whole) {
      const char* last = nullptr;
      const MayaToken kind = lex.GetNextToken(&start, &last);
      const auto from = static_cast<std::size_t>(start - piece.text);
      const auto wordEnd = static_cast<std::size_t>(last - piece.text) + 1;
      if (kind == EndOfFile || cut <= from) break;
      const bool word = kind == Number || kind == Option || (kind >= File && kind <= Identifier);
      if (word ? cut > wordEnd : cut >= wordEnd) {
        if (kind == Semicolon) return 0;
        continue;
      }
      // Of a comment only its slash is left, of an option only its dash.
      if (kind == Comment && cut == from + 1) return 1289985;
      if (text[from] == '-' && cut == from + 1) break;
      return 1289986;
    }
    return whole >= piece.openFrom ? 1289986 : 0;
  }
};

TEST_F(TruncationTest, EveryCutIsTakenAsTheRulesSay) {
  const std::string scene = RichScene();
  std::size_t pieceStart = 0;
  for (const ScenePiece& piece : RichScenePieces()) {
    const std::size_t size = std::string_view(piece.text).size();
    for (std::size_t cut = 0; cut < size; ++cut) {
      const std::string text = scene.substr(0, pieceStart + cut);
      SCOPED_TRACE(std::string("cut after: ") + std::string(piece.text, cut));
      const HostError code = Predict(piece, cut);
      ASSERT_EQ(Read(text), code);
      if (code == 0)
        ASSERT_THAT(Messages(), IsEmpty());
      else
        ASSERT_THAT(Messages(), ElementsAre(code == 1289986 ? kUnexpectedEndText : kReadingText));
      EndScene();
      ASSERT_THAT(HeldObjects(), IsEmpty());
    }
    pieceStart += size;
  }
  EXPECT_EQ(Read(scene), 0);
}

TEST_F(TruncationTest, TheWholeSceneGivesWhatItSays) {
  ASSERT_EQ(Read(RichScene()), 0);
  ASSERT_EQ(TransformCount(), 2);
  EXPECT_STREQ(TransformAt(0).name, "rig");
  EXPECT_STREQ(TransformAt(0).parent, "|top");
  EXPECT_THAT(Values(TransformAt(0).translate), ElementsAre(1, -2.5, 300));
  EXPECT_THAT(Values(TransformAt(0).scalePivot), ElementsAre(4, 5, 6));
  EXPECT_THAT(Values(TransformAt(0).curve), ElementsAre(0, -1, -1, -1, -1, -1, -1, -1, -1, -1, -1, -1));
  EXPECT_EQ(TransformAt(1).curve[kTargetSlot], 0);
  EXPECT_EQ(TransformAt(1).curve[kConstrainedSlot], 0);
  ASSERT_EQ(CameraCount(), 1);
  EXPECT_DOUBLE_EQ(CameraAt(0).focalLength, 50.0);
  EXPECT_EQ(CameraAt(0).filmFit, 1);
  EXPECT_EQ(CameraAt(0).orthographic, 1);
  EXPECT_EQ(CameraAt(0).focalLengthCurve, 1);
  ASSERT_EQ(CurveCount(), 3);
  EXPECT_EQ(KeysOf(0), (Keys{{1, 2}}));
  EXPECT_EQ(CurveAt(2).keys, nullptr);
  EXPECT_EQ(LocatorCount(), 1);
  EXPECT_EQ(scene().resolutionWidth, 1920);
  EXPECT_EQ(scene().resolutionHeight, 1080);
  EXPECT_EQ(scene().timeUnit, 12);
  EXPECT_DOUBLE_EQ(scene().frameRate, 23.976);
}

// A replaced byte may turn one command into another, so only the set of outcomes is known; memory that is
// read or freed wrongly, or left behind, shows by itself.
TEST_F(TruncationTest, EveryReplacedByteIsSurvivedWithAKnownOutcome) {
  const std::string scene = RichScene();
  for (const char patch : {'\0', '\xff', '"', ';', '\\', '*', '/', '-', '\n', ':', '9', ' '}) {
    for (std::size_t at = 0; at < scene.size(); ++at) {
      std::string text = scene;
      text[at] = patch;
      const HostError code = Read(text);
      SCOPED_TRACE("byte " + std::to_string(at) + " as " + std::to_string(static_cast<unsigned char>(patch)));
      ASSERT_THAT(code, AnyOf(0, 1289985, 1289986, HOST_ERR_NUMBER_SYNTAX, HOST_ERR_NUMBER_RANGE));
      if (code == 1289985)
        ASSERT_THAT(Messages(), ElementsAre(kReadingText));
      else if (code == 1289986)
        ASSERT_THAT(Messages(), ElementsAre(kUnexpectedEndText));
      else
        ASSERT_THAT(Messages(), IsEmpty());
      EndScene();
      ASSERT_THAT(HeldObjects(), IsEmpty());
    }
  }
}

TEST_F(TruncationTest, EveryPairOfCommandsCutInItsSecondLeavesNothingBehind) {
  const std::vector<ScenePiece>& pieces = RichScenePieces();
  for (const ScenePiece& first : pieces) {
    for (const ScenePiece& second : pieces) {
      const std::string_view tail(second.text);
      const std::string text = std::string(first.text) + std::string(tail.substr(0, tail.size() - 2));
      const HostError code = Read(text);
      ASSERT_THAT(code, AnyOf(0, 1289985, 1289986)) << text;
      ASSERT_EQ(Messages().size(), code == 0 ? 0u : 1u) << text;
      EndScene();
      ASSERT_THAT(HeldObjects(), IsEmpty()) << text;
    }
  }
}

}  // namespace
}  // namespace testsupport
