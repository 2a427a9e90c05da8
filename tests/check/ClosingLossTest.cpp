// The closing line of an import, against the report of a check on the same import: what one of them says to
// be lost, the other one reports too.
#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <set>
#include <string>
#include <string_view>
#include <vector>

#include "bake/Selection.h"
#include "check/Check.h"
#include "tests/check/GeneratedScene.h"
#include "tests/support/LoadedHost.h"
#include "tests/support/WideTests.h"
#include "tools/mayascene/ClosingLine.h"
#include "tools/mayascene/ImportedLayers.h"

namespace check_test {
namespace {

namespace fs = std::filesystem;
using diag::Code;

// Part of a closing line, and the codes under which a check says the same.
struct Same {
  std::string_view part;
  std::vector<Code> codes;
};

const std::vector<Same>& Pairs() {
  static const std::vector<Same> pairs = {
      {"the path between the keys", {Code::KeysAreNoBake}},
      {"turns by half a turn", {Code::KeysAreNoBake}},
      {"stand at other times", {Code::KeysAreNoBake}},
      {"begin at another frame", {Code::KeysStartApart}},
      {"has a single key", {Code::ChannelsOfOneKey, Code::ConnectionToPath}},
      {"no key of",
       {Code::ConnectionToPath, Code::SameNames, Code::NamesDifferInCase, Code::ApertureMotionLost,
        Code::FitMotionLost}},
      {"makes of",
       {Code::DrivenByNoCurve, Code::CurveThroughNode, Code::FocalLengthElsewhere, Code::LookAtShortNames,
        Code::LookAtWeightLast, Code::LookAtNotTaken, Code::ApertureMotionLost, Code::FitMotionLost}},
      {"the camera scale", {Code::CameraScaleLost}},
      {"the lens squeeze", {Code::LensSqueezeLost}},
      {"the film fit", {Code::FitDiffers}},
      {"the rotate order", {Code::RotateOrderLost}},
      {"the rotate axis", {Code::RotateAxisLost}},
      {"the shear", {Code::ShearLost}},
      {"the translation of the", {Code::PivotTranslationLost}},
      {"the independence", {Code::InheritanceOff}},
      {"the offset parent matrix", {Code::OffsetMatrixLost}},
      {"the place of", {Code::ParentNotImported}},
      {"does not come over without a camera", {Code::LocatorsWithoutCamera}},
      {"what stands above", {Code::ParentIsPath, Code::ParentNotImported, Code::ParentElsewhere}},
      {"which is in another file", {Code::ParentIsPath, Code::ParentElsewhere}},
      {"the picture of", {Code::PictureSizeAssumed}},
      {"the rate of", {Code::RateDiffers}},
      {"the camera \"", {Code::CameraNotImported}},
      {"has no \"null\" in its name", {Code::LocatorsLeftOut}},
      {"a path without quotes", {Code::UnquotedPath}},
      {"a list of attribute aliases", {Code::AliasList}},
      {"a merge conflict", {Code::ConflictMarkStops}},
      {"a template field", {Code::TemplateFieldStops}},
      {"a character that no word", {Code::RefusedByte}},
      {"a comment in the last line", {Code::LastCommentOpen}},
      {"a string without", {Code::CutOffInString}},
      {"a comment without", {Code::CutOffInComment}},
      {"a command that the file cuts off", {Code::CutOffInCommand}},
      {"different numbers of keys", {Code::UnequalKeys}},
      {"a number that", {Code::NumberTooLarge, Code::NumberUnreadable}},
  };
  return pairs;
}

std::vector<Code> CodesOf(std::string_view sentence) {
  for (const Same& same : Pairs()) {
    if (sentence.find(same.part) != std::string_view::npos) return same.codes;
  }
  return {};
}

// One host for many imports.
class Both {
 public:
  // What only one of them says; empty where they agree.
  std::string DisagreeOver(const std::string& text) {
    const refhost::CallbackResult result = host_.Import(text);
    const check::CameOver cameOver =
        mayascene::whatCameOver(mayascene::lookAtScene(host_.ScenePath()), result, false);
    if (cameOver.stop == check::Stop::NotAScene) return {};  // no closing line
    const check::Report report = check::Check(text, cameOver, {.all = true, .only = {}});
    diag::Collector collector(text);
    const scene::Scene scene = scene::Read(text, collector);
    const auto loss = mayascene::lossOf(result, scene, &collector);
    if (!loss) return SaidByTheCheckAlone(scene, report);
    ++said_;
    const std::vector<Code> codes = CodesOf(loss->sentence);
    for (const check::Finding& finding : report.findings) {
      if (std::find(codes.begin(), codes.end(), finding.diagnostic.code) != codes.end()) return {};
    }
    return "the check does not say: " + loss->sentence;
  }

  int said() const { return said_; }

 private:
  // The closing line speaks of cameras, of what stands above them, and of the picture, but not of locators.
  static bool IsOfTheClosingLine(const check::Finding& finding, const std::set<std::string>& names) {
    const diag::Diagnostic& one = finding.diagnostic;
    if (diag::EntryOf(one.code).severity == diag::Severity::Note) return false;
    const auto said = [&](const Same& same) {
      return std::find(same.codes.begin(), same.codes.end(), one.code) != same.codes.end();
    };
    // Names are a cause, not a loss; and the closing line does not ask what an aimed camera looks at.
    if (one.code == Code::SameNames || one.code == Code::NamesDifferInCase ||
        one.code == Code::LookAtWeightLast)
      return false;
    if (std::none_of(Pairs().begin(), Pairs().end(), said)) return false;
    return one.code == Code::PictureSizeAssumed || one.code == Code::RateDiffers ||
           (!one.arguments.empty() && names.contains(one.arguments.front()));
  }

  static std::string SaidByTheCheckAlone(const scene::Scene& scene, const check::Report& report) {
    std::set<std::string> names;
    for (scene::NodeId id = 0; id < scene.nodes().size(); ++id) {
      if (!bake::IsSetUp(scene, id)) continue;
      for (scene::NodeId node = id; node != scene::kNoNode; node = scene.node(node).parent)
        names.emplace(scene.node(node).name);
    }
    for (const check::Finding& finding : report.findings) {
      if (IsOfTheClosingLine(finding, names))
        return "no closing line, but " + diag::HeadLineOf("shot.ma", finding.diagnostic);
    }
    return {};
  }

  testsupport::LoadedHost host_{testsupport::WithUnits(false)};
  int said_ = 0;
};

std::string TextOf(const fs::path& path) {
  std::ifstream in(path, std::ios::binary);
  return {std::istreambuf_iterator<char>(in), {}};
}

TEST(ClosingLossTest, AgreesWithTheCheckOverAllScenesThatLieHere) {
  Both both;
  for (const char* const folder :
       {"examples", "tests/scenes/hazards", "tests/scenes/production", "fuzz/seeds"}) {
    for (const auto& entry : fs::directory_iterator(fs::path(MAYASCENE_SOURCE_DIR) / folder)) {
      if (entry.path().extension() != ".ma") continue;
      EXPECT_EQ(both.DisagreeOver(TextOf(entry.path())), "") << entry.path();
    }
  }
  EXPECT_GT(both.said(), 20);
}

TEST(ClosingLossTest, AgreesWithTheCheckOverGeneratedScenes) {
  Both both;
  const std::size_t scenes = testsupport::HowMany({.quick = 200, .wide = 5'000, .sanitized = 200});
  int shown = 0;
  for (std::uint64_t seed = 1; seed <= scenes && shown < 12; ++seed) {
    const std::string text = GeneratedScene(seed);
    const std::string wrong = both.DisagreeOver(text);
    EXPECT_EQ(wrong, "") << "seed " << seed;
    shown += wrong.empty() ? 0 : 1;
  }
}

}  // namespace
}  // namespace check_test
