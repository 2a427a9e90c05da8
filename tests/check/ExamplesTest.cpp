// The example that the table of codes has for a code of the check gives that code.
#include <gtest/gtest.h>

#include <cstdlib>
#include <fstream>
#include <iterator>
#include <set>
#include <string>
#include <string_view>

#include "tests/check/CheckedText.h"

namespace check_test {
namespace {

using diag::Code;

bool IsOfTheCheck(Code code) {
  return (code >= Code::SameNames && code <= Code::TextAfterNul) ||
         (code >= Code::ImportStopped && code < Code::ExportNotFinite);
}

// What is typed in a shell to make the scene.
constexpr std::string_view kMakesScene = "$ printf ";

// What is typed in a shell to have the case: it cannot be made without a machine that is short of something,
// or without minutes.
const std::set<Code> kNotMade = {Code::CheckTimedOut, Code::CheckBrokeOff, Code::CheckOutOfMemory,
                                 Code::ReportTooLarge, Code::CheckNotStarted};

std::string MadeBy(std::string_view command) {
  const testsupport::TemporaryFolder folder;
  const std::string words = "cd '" + folder.path().string() + "' && " + std::string(command.substr(2));
  EXPECT_EQ(std::system(words.c_str()), 0) << words;
  std::ifstream in(folder.path() / "shot.ma", std::ios::binary);
  EXPECT_TRUE(in) << words;
  return {std::istreambuf_iterator<char>(in), {}};
}

// What the example leaves out: the head, the resolution, and the camera that it speaks of.
std::string SceneOf(const diag::Entry& entry) {
  const std::string_view example = entry.example;
  if (example.starts_with(kMakesScene)) return MadeBy(example);
  if (entry.code == Code::NotMayaAscii) return std::string(example);
  const bool withoutCamera =
      entry.code == Code::LocatorsWithoutCamera || entry.code == Code::NoCameraToImport;
  if (withoutCamera) return kHead + std::string(example);
  const auto has = [example](std::string_view text) { return example.find(text) != std::string_view::npos; };
  std::string text = has("currentUnit") ? kHead.substr(0, kHead.find('\n') + 1) : kHead;
  if (!has("defaultResolution")) text += kResolution;
  const std::string_view transform = "createNode transform -n \"shotCam\"";
  if (!has(transform)) text += std::string(transform) + ";\n";
  const std::string camera =
      has("createNode camera") ? "" : "createNode camera -n \"shotCamShape\" -p \"shotCam\";\n" + kLens;
  if (!has(transform)) text += camera;
  text += example;
  // The end of the text is what these are about.
  if (entry.code >= Code::LastCommentOpen && entry.code <= Code::CutOffInCommand) return text;
  return text + '\n' + (has(transform) ? camera : "");
}

TEST(ExamplesTest, EachGivesItsCode) {
  int looked = 0;
  for (const diag::Entry& entry : diag::Table()) {
    if (!IsOfTheCheck(entry.code) || kNotMade.contains(entry.code)) continue;
    SCOPED_TRACE(std::string(entry.symbol));
    const Checked checked(SceneOf(entry));
    EXPECT_GE(checked.CountOf(entry.code), 1u) << checked.All();
    ++looked;
  }
  EXPECT_EQ(looked, 72);
}

}  // namespace
}  // namespace check_test
